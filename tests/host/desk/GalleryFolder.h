// SPDX-License-Identifier: MIT
#pragma once

#include "DeskFiles.h"

#include <QDir>

/** An empty folder for pictures, another one for every object. */
class GalleryFolder
{
public:
    GalleryFolder()
    {
        QDir temporary(StatReportTest::temporaryPath(QString()));
        for (int i = 1; !temporary.mkdir(m_name); ++i)
            m_name = QStringLiteral("pictures %1").arg(i);
        path = temporary.filePath(m_name);
    }

    QString add(const QString &name, const QSize &size = QSize(40, 30), const QColor &color = Qt::blue) const
    {
        return DeskFiles::image(m_name + QLatin1Char('/') + name, size, color);
    }
    QString addBroken(const QString &name) const
    {
        return DeskFiles::text(m_name + QLatin1Char('/') + name, "rubbish");
    }
    QStringList names() const { return QDir(path).entryList(QDir::Files, QDir::Name); }

    QString path;

private:
    QString m_name = QStringLiteral("pictures");
};

// SPDX-License-Identifier: MIT
#pragma once

#include "support/StatReportTest.h"

#include <QFile>
#include <QImage>

/** Files for the tests of the measuring application, made in the test's own folder. */
class DeskFiles
{
public:
    static QString demoSession()
    {
        return StatReportTest::sourcePath(QStringLiteral("examples/sessions/demo.json"));
    }

    static QString image(const QString &name, const QSize &size = QSize(40, 30),
                         const QColor &color = Qt::blue)
    {
        QImage image(size, QImage::Format_RGB32);
        image.fill(color);
        const QString path = StatReportTest::temporaryPath(name);
        image.save(path);
        return path;
    }

    static QString text(const QString &name, const QByteArray &bytes)
    {
        const QString path = StatReportTest::temporaryPath(name);
        QFile file(path);
        if (file.open(QIODevice::WriteOnly))
            file.write(bytes);
        return path;
    }

    /** Two objects with a length and a mass each. */
    static QString table(const QString &name = QStringLiteral("table.csv"))
    {
        return text(name, "Object,Length [mm],Mass [g]\nBolt A,10.5,2\nBolt B,9.5,3\n");
    }

    static QByteArray bytes(const QString &path)
    {
        QFile file(path);
        return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
    }
};

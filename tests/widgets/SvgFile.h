// SPDX-License-Identifier: MIT
#pragma once

#include "support/StatReportTest.h"

#include <QFile>

/** A square icon of 24 units, filled with one colour, made for a test. */
class SvgFile
{
public:
    /** \a opacity from 0 to 1. */
    explicit SvgFile(const QString &fill, const QString &opacity = QStringLiteral("1"))
        : m_path(StatReportTest::temporaryPath(QString(fill).remove(QLatin1Char('#')) + opacity +
                                               QStringLiteral(".svg")))
    {
        QFile file(m_path);
        if (file.open(QIODevice::WriteOnly))
            file.write(
                QStringLiteral("<svg xmlns=\"http://www.w3.org/2000/svg\" viewBox=\"0 0 24 24\">"
                               "<rect width=\"24\" height=\"24\" fill=\"%1\" fill-opacity=\"%2\"/></svg>")
                    .arg(fill, opacity)
                    .toUtf8());
    }

    QString path() const { return m_path; }

private:
    QString m_path;
};

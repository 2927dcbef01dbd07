// SPDX-License-Identifier: MIT
#pragma once

#include "support/StatReportTest.h"

#include <QDir>
#include <QFile>
#include <QImage>

/** A small guide of three chapters with a wide picture; its first chapters fill more than a screen. */
class GuideFile
{
public:
    static constexpr int pictureWidth = 2000;
    static constexpr int pictureHeight = 1000;

    /** Writes it into a folder of the test; the path of the Markdown file. \a name is that of the file. */
    static QString create(const QString &name = QStringLiteral("guide.md"))
    {
        const QString folder = StatReportTest::temporaryPath(QStringLiteral("guide"));
        QDir().mkpath(folder + QStringLiteral("/pictures"));
        QImage picture(pictureWidth, pictureHeight, QImage::Format_RGB32);
        picture.fill(Qt::red);
        picture.save(folder + QStringLiteral("/pictures/wide.png"));
        const QString path = folder + QLatin1Char('/') + name;
        QFile file(path);
        if (file.open(QIODevice::WriteOnly))
            file.write(text().toUtf8());
        return path;
    }

private:
    static QString text()
    {
        const QString filler = QStringLiteral("Some words to read.\n\n").repeated(80);
        return QStringLiteral(
                   "# The guide\n\n"
                   "[second](#second-chapter-its-end) [table](tables.md) [web](https://a.invalid/b)\n\n"
                   "![A picture](pictures/wide.png)\n\n"
                   "## First `code` chapter\n\n%1Needle one. `Ctrl+S`\n\n"
                   "| key | meaning |\n|---|---|\n| `A` | arc |\n\n"
                   "```\nprogram --option\n```\n\n"
                   "- An item with `--dashes`\n- Another\n\n"
                   "## Second chapter, its end\n\n%1Needle two.\n\n"
                   "### Deeper\n\n%1"
                   "## Second chapter, its end\n\n%1")
            .arg(filler);
    }
};

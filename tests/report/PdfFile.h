// SPDX-License-Identifier: MIT
#pragma once

#include <QImage>
#include <QProcess>
#include <QRectF>
#include <QRegularExpression>
#include <QSizeF>
#include <QStringList>
#include <QTemporaryDir>
#include <QVector>

#include <algorithm>

/** One line of the list of pictures in a PDF. */
struct PdfPicture
{
    QString type;     ///< "image", or "smask" for its transparency
    QSize size;       ///< in the picture's own pixels
    QString encoding; ///< "jpeg", or "image" where nothing is lost
};

/** One line of the list of fonts in a PDF. */
struct PdfFont
{
    QString name;
    bool isEmbedded = false;
};

/** A word of a page. */
struct PdfWord
{
    QString text;
    QRectF rect; ///< in points from the page's top-left corner
};

/** Looks at a PDF file with the command-line tools of its readers. */
class PdfFile
{
public:
    explicit PdfFile(const QString &path)
        : m_path(path)
    {}

    /** Whether every object of the file can be read. */
    bool isSound() const
    {
        QProcess process;
        process.start(QStringLiteral("qpdf"), {QStringLiteral("--check"), m_path});
        return process.waitForFinished(kTimeout) && process.exitCode() == 0;
    }

    int pageCount() const
    {
        const QRegularExpression line(QStringLiteral("Pages:\\s+(\\d+)"));
        return line.match(run(QStringLiteral("pdfinfo"), {m_path})).captured(1).toInt();
    }

    /** Media boxes of all pages, in points. */
    QVector<QSizeF> mediaBoxes() const
    {
        const QString text = run(QStringLiteral("pdfinfo"), {QStringLiteral("-box"), QStringLiteral("-l"),
                                                             QString::number(pageCount()), m_path});
        const QRegularExpression line(QStringLiteral("MediaBox:\\s+(\\S+)\\s+(\\S+)\\s+(\\S+)\\s+(\\S+)"));
        QVector<QSizeF> boxes;
        QRegularExpressionMatchIterator it = line.globalMatch(text);
        while (it.hasNext()) {
            const QRegularExpressionMatch match = it.next();
            boxes.append({match.captured(3).toDouble() - match.captured(1).toDouble(),
                          match.captured(4).toDouble() - match.captured(2).toDouble()});
        }
        return boxes;
    }

    /** Texts of the pages in reading order, words and lines apart by white space. */
    QStringList pageTexts() const
    {
        QStringList pages =
            run(QStringLiteral("pdftotext"), {QStringLiteral("-layout"), QStringLiteral("-enc"),
                                              QStringLiteral("UTF-8"), m_path, QStringLiteral("-")})
                .split(QLatin1Char('\f'));
        pages.removeLast(); // every page ends with a form feed
        return pages;
    }

    /** What in \a text looks like \a pattern, in order. */
    static QStringList words(const QString &text, const QString &pattern)
    {
        QStringList found;
        QRegularExpressionMatchIterator it = QRegularExpression(pattern).globalMatch(text);
        while (it.hasNext())
            found.append(it.next().captured());
        return found;
    }

    /** Distance of a word from the page's top-left corner, in points; negative where it does not stand. */
    QPointF wordPosition(int page, const QString &word) const
    {
        const QString number = QString::number(page + 1);
        const QString text =
            run(QStringLiteral("pdftotext"), {QStringLiteral("-bbox"), QStringLiteral("-f"), number,
                                              QStringLiteral("-l"), number, m_path, QStringLiteral("-")});
        const QRegularExpression line(QStringLiteral("xMin=\"([0-9.-]+)\" yMin=\"([0-9.-]+)\"[^>]*>%1<")
                                          .arg(QRegularExpression::escape(word)));
        const QRegularExpressionMatch match = line.match(text);
        return match.hasMatch() ? QPointF(match.captured(1).toDouble(), match.captured(2).toDouble())
                                : QPointF(-1, -1);
    }

    /** All words of a page with their places. */
    QVector<PdfWord> wordsOf(int page) const
    {
        const QString number = QString::number(page + 1);
        const QString text =
            run(QStringLiteral("pdftotext"),
                {QStringLiteral("-bbox"), QStringLiteral("-enc"), QStringLiteral("UTF-8"),
                 QStringLiteral("-f"), number, QStringLiteral("-l"), number, m_path, QStringLiteral("-")});
        const QRegularExpression line(QStringLiteral(
            "xMin=\"([0-9.-]+)\" yMin=\"([0-9.-]+)\" xMax=\"([0-9.-]+)\" yMax=\"([0-9.-]+)\">([^<]*)<"));
        QVector<PdfWord> words;
        QRegularExpressionMatchIterator it = line.globalMatch(text);
        while (it.hasNext()) {
            const QRegularExpressionMatch match = it.next();
            const auto at = [&match](int index) { return match.captured(index).toDouble(); };
            words.append(
                {unescaped(match.captured(5)), QRectF(QPointF(at(1), at(2)), QPointF(at(3), at(4)))});
        }
        return words;
    }

    QVector<PdfFont> fonts() const
    {
        // Name, type, encoding, then "emb sub uni" and the object's number and generation.
        const QRegularExpression end(QStringLiteral("(yes|no)\\s+(yes|no)\\s+(yes|no)\\s+\\d+\\s+\\d+$"));
        QVector<PdfFont> fonts;
        for (const QString &line : listLines(QStringLiteral("pdffonts"), {m_path})) {
            const QString name = line.section(QLatin1Char(' '), 0, 0);
            fonts.append({name, end.match(line).captured(1) == QLatin1String("yes")});
        }
        return fonts;
    }

    QVector<PdfPicture> pictures() const
    {
        QVector<PdfPicture> pictures;
        for (const QString &line :
             listLines(QStringLiteral("pdfimages"), {QStringLiteral("-list"), m_path})) {
            const QStringList columns = line.simplified().split(QLatin1Char(' '));
            pictures.append({columns.value(2), QSize(columns.value(3).toInt(), columns.value(4).toInt()),
                             columns.value(8)});
        }
        return pictures;
    }

    /** The picture's pixels as the file holds them, without its transparency. */
    QImage firstPicture() const
    {
        const QTemporaryDir dir;
        run(QStringLiteral("pdfimages"), {QStringLiteral("-png"), m_path, dir.filePath(QStringLiteral("p"))});
        return QImage(dir.filePath(QStringLiteral("p-000.png")));
    }

    /** A page as it looks on paper, \a dpi pixels to the inch. */
    QImage rendered(int page, int dpi) const
    {
        const QTemporaryDir dir;
        const QString number = QString::number(page + 1);
        run(QStringLiteral("pdftoppm"),
            {QStringLiteral("-png"), QStringLiteral("-singlefile"), QStringLiteral("-f"), number,
             QStringLiteral("-r"), QString::number(dpi), m_path, dir.filePath(QStringLiteral("page"))});
        return QImage(dir.filePath(QStringLiteral("page.png")));
    }

private:
    static constexpr int kTimeout = 60000;

    static QString run(const QString &program, const QStringList &arguments)
    {
        QProcess process;
        process.start(program, arguments);
        if (!process.waitForFinished(kTimeout) || process.exitCode() != 0)
            return QString();
        return QString::fromUtf8(process.readAllStandardOutput());
    }

    static QString unescaped(QString text)
    {
        return text.replace(QLatin1String("&lt;"), QLatin1String("<"))
            .replace(QLatin1String("&gt;"), QLatin1String(">"))
            .replace(QLatin1String("&quot;"), QLatin1String("\""))
            .replace(QLatin1String("&amp;"), QLatin1String("&"));
    }

    // The lines below the two of the table's head.
    static QStringList listLines(const QString &program, const QStringList &arguments)
    {
        return run(program, arguments).split(QLatin1Char('\n'), Qt::SkipEmptyParts).mid(2);
    }

    QString m_path;
};

// SPDX-License-Identifier: MIT
#include "KvDeskGuideText.h"

#include "KvDeskGuidePictures.h"
#include "KvDeskLanguages.h"
#include "gui/QtAdvancedStylesheet.h"
#include "kernel/ZtLeftToRight.h"

#include <QAbstractTextDocumentLayout>
#include <QApplication>
#include <QDesktopServices>
#include <QFile>
#include <QFileInfo>
#include <QMimeData>
#include <QRegularExpression>
#include <QScrollBar>
#include <QTextBlock>
#include <QTextList>
#include <QTextTable>
#include <QWheelEvent>

#include <algorithm>

namespace {

constexpr int margin = 16;
constexpr int cellPadding = 4;
constexpr int tableMargin = 8;
constexpr int headingTopMargin = 16;
constexpr int blockMargin = 8;
constexpr int itemMargin = 4;
constexpr int zoomStep = 10;
constexpr int smallestZoom = 50;
constexpr int largestZoom = 300;
/// WORD JOINER, which has no width: Qt puts a blank of the first letter's font between a bullet and the text,
/// and one of the program's font is so narrow that the bullet touches the letters.
constexpr QChar bulletSpacer{0x2060};

QColor themeColor(const char *token)
{
    return acss::QtAdvancedStylesheet::getInstance()->color(QLatin1String(token));
}

// "guide.Arabic.md"; a file without a language in its name reads from left to right.
Qt::LayoutDirection directionOf(const QString &path)
{
    const QString language = QFileInfo(path).completeBaseName().section(QLatin1Char('.'), -1);
    return KvDeskLanguages::localeOf(language).textDirection();
}

QString read(const QString &path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? QString::fromUtf8(file.readAll()) : QString();
}

struct Part
{
    int position;
    int length;
    QTextCharFormat format;
};

// Changing a format while walking over the text would split what is walked over.
QVector<Part> partsOf(const QTextDocument *document)
{
    QVector<Part> parts;
    for (QTextBlock block = document->begin(); block.isValid(); block = block.next()) {
        for (auto it = block.begin(); !it.atEnd(); ++it)
            parts.append({it.fragment().position(), it.fragment().length(), it.fragment().charFormat()});
    }
    return parts;
}

void setFormat(QTextDocument *document, const Part &part, const QTextCharFormat &format)
{
    QTextCursor cursor(document);
    cursor.setPosition(part.position);
    cursor.setPosition(part.position + part.length, QTextCursor::KeepAnchor);
    cursor.setCharFormat(format);
}

// Columns stand in the order of the text's cells, from left to right: Qt has no other.
QString withMirroredTables(const QString &markdown)
{
    static const QRegularExpression bar(QStringLiteral("(?<!\\\\)\\|"));
    QStringList lines = markdown.split(QLatin1Char('\n'));
    for (QString &line : lines) {
        if (!line.startsWith(QLatin1Char('|')))
            continue;
        QStringList cells = line.split(bar);
        std::reverse(cells.begin(), cells.end());
        line = cells.join(QLatin1Char('|'));
    }
    return lines.join(QLatin1Char('\n'));
}

// Only code has a font in Markdown.
bool isCode(const QTextCharFormat &format)
{
    return format.hasProperty(QTextFormat::FontFamily);
}

bool hasBullet(const QTextBlock &block)
{
    return block.textList() && block.textList()->format().style() > QTextListFormat::ListDecimal;
}

// Qt gives it the system's font in a size of its own, which would not follow the zoom.
QTextCharFormat codeFormat(const QTextCharFormat &old)
{
    QTextCharFormat format;
    for (const int kept : {QTextFormat::FontSizeAdjustment, QTextFormat::IsAnchor, QTextFormat::AnchorName,
                           QTextFormat::AnchorHref}) {
        if (old.hasProperty(kept))
            format.setProperty(kept, old.property(kept));
    }
    format.setFontFamily(QStringLiteral("monospace"));
    format.setFontFamilies({QStringLiteral("DejaVu Sans Mono"), QStringLiteral("Noto Sans Mono"),
                            QStringLiteral("Liberation Mono"), QStringLiteral("monospace")});
    format.setFontStyleHint(QFont::Monospace);
    format.setFontFixedPitch(true);
    format.setBackground(themeColor("raised-hover"));
    return format;
}

// The accent alone is too dark to read on a dark page.
QTextCharFormat linkFormat(QTextCharFormat format)
{
    format.setForeground(themeColor("text"));
    format.setFontUnderline(true);
    format.setUnderlineColor(themeColor("accent-hover"));
    return format;
}

QTextBlockFormat spaced(int top, int bottom)
{
    QTextBlockFormat format;
    format.setTopMargin(top);
    format.setBottomMargin(bottom);
    return format;
}

// Neighbours share the larger of their margins.
QTextBlockFormat spaceOf(const QTextBlock &block)
{
    if (block.blockFormat().headingLevel() > 0)
        return spaced(block.position() == 0 ? 0 : headingTopMargin, blockMargin);
    if (block.blockFormat().hasProperty(QTextFormat::BlockCodeFence))
        return spaced(0, 0);
    return block.textList() ? spaced(itemMargin, itemMargin) : spaced(blockMargin, blockMargin);
}

} // namespace

KvDeskGuideText::KvDeskGuideText(const QString &path, QWidget *parent)
    : QTextBrowser(parent)
    , m_folder(QFileInfo(path).absolutePath())
{
    setLayoutDirection(directionOf(path));
    setFrameShape(QFrame::NoFrame);
    setOpenLinks(false);
    setUndoRedoEnabled(false);
    document()->setDocumentMargin(margin);
    document()->documentLayout()->registerHandler(QTextFormat::ImageObject,
                                                  new KvDeskGuidePictures(m_folder, this));
    load(path);
    setZoom(m_zoom);
    connect(this, SIGNAL(anchorClicked(QUrl)), this, SLOT(slotOpenLink(QUrl)));
    connect(verticalScrollBar(), SIGNAL(valueChanged(int)), this, SLOT(slotScrolled()));
    connect(acss::QtAdvancedStylesheet::getInstance(), SIGNAL(currentThemeChanged(QString)), this,
                                                              SLOT(slotColourText()));
}

void KvDeskGuideText::load(const QString &path)
{
    const QString markdown = read(path);
    setMarkdown(layoutDirection() == Qt::RightToLeft ? withMirroredTables(markdown) : markdown);
    setDirection(layoutDirection());
    nameHeadings();
    spaceBlocks();
    slotColourText();
    // The place that the first step back goes to.
    if (!m_headings.isEmpty())
        showHeading(0);
}

void KvDeskGuideText::setDirection(Qt::LayoutDirection direction)
{
    for (QTextBlock block = document()->begin(); block.isValid(); block = block.next()) {
        const bool isCodeBlock = block.blockFormat().hasProperty(QTextFormat::BlockCodeFence);
        QTextBlockFormat format;
        format.setLayoutDirection(isCodeBlock ? Qt::LeftToRight : direction);
        QTextCursor(block).mergeBlockFormat(format);
    }
    if (direction == Qt::RightToLeft)
        isolateCode();
}

// Dashes, slashes and brackets at the ends of a piece of code would change sides. The marks have no width.
void KvDeskGuideText::isolateCode()
{
    QVector<Part> parts = partsOf(document());
    std::reverse(parts.begin(), parts.end());
    for (const Part &part : qAsConst(parts)) {
        const QTextBlock block = document()->findBlock(part.position);
        if (!isCode(part.format) || block.blockFormat().hasProperty(QTextFormat::BlockCodeFence))
            continue;
        QTextCursor cursor(document());
        cursor.setPosition(part.position);
        cursor.setPosition(part.position + part.length, QTextCursor::KeepAnchor);
        cursor.insertText(ZtLeftToRight::marked(cursor.selectedText()), part.format);
    }
}

QString KvDeskGuideText::anchorOf(const QString &title)
{
    QString anchor;
    for (const QChar c : title.toLower()) {
        if (c.isLetterOrNumber() || c == QLatin1Char('-') || c == QLatin1Char('_'))
            anchor += c;
        else if (c.isSpace())
            anchor += QLatin1Char('-');
    }
    return anchor;
}

void KvDeskGuideText::nameHeadings()
{
    QStringList anchors;
    for (QTextBlock block = document()->begin(); block.isValid(); block = block.next()) {
        const int level = block.blockFormat().headingLevel();
        if (level == 0 || block.text().isEmpty())
            continue;
        const QString anchor = anchorOf(block.text());
        const int times = anchors.count(anchor);
        anchors.append(anchor);
        const QString name = times == 0 ? anchor : QStringLiteral("%1-%2").arg(anchor).arg(times);
        m_headings.append({block.text(), name, level, block.position()});
    }
    for (const Heading &heading : qAsConst(m_headings)) {
        QTextCursor cursor(document());
        cursor.setPosition(heading.position);
        cursor.movePosition(QTextCursor::NextCharacter, QTextCursor::KeepAnchor);
        QTextCharFormat name;
        name.setAnchor(true);
        name.setAnchorNames({heading.anchor});
        cursor.mergeCharFormat(name);
    }
}

void KvDeskGuideText::spaceBlocks()
{
    for (QTextBlock block = document()->begin(); block.isValid(); block = block.next()) {
        QTextCursor cursor(block);
        if (!cursor.currentTable())
            cursor.mergeBlockFormat(spaceOf(block));
        if (hasBullet(block))
            cursor.insertText(bulletSpacer, codeFormat(block.charFormat()));
    }
}

void KvDeskGuideText::slotColourText()
{
    for (const Part &part : partsOf(document())) {
        if (isCode(part.format))
            setFormat(document(), part, codeFormat(part.format));
        else if (!part.format.anchorHref().isEmpty())
            setFormat(document(), part, linkFormat(part.format));
    }
    colourTables();
}

void KvDeskGuideText::colourTables()
{
    for (QTextFrame *const frame : document()->rootFrame()->childFrames()) {
        auto *const table = qobject_cast<QTextTable *>(frame);
        if (!table)
            continue;
        QTextTableFormat format = table->format();
        format.setLayoutDirection(layoutDirection());
        // A table at the right would otherwise stand in the margin of the text.
        if (layoutDirection() == Qt::RightToLeft) {
            format.setAlignment(Qt::AlignRight);
            format.setRightMargin(margin);
        }
        format.setBorder(1);
        format.setBorderCollapse(true);
        format.setBorderStyle(QTextFrameFormat::BorderStyle_Solid);
        format.setBorderBrush(themeColor("line"));
        format.setCellPadding(cellPadding);
        format.setCellSpacing(0);
        format.setTopMargin(tableMargin);
        format.setBottomMargin(tableMargin);
        table->setFormat(format);
    }
}

int KvDeskGuideText::headingInView() const
{
    // A heading whose line can be seen whole counts already.
    const int top = verticalScrollBar()->value() + 2 * margin;
    const auto isBelow = [this, top](const Heading &heading) {
        const QTextBlock block = document()->findBlock(heading.position);
        return document()->documentLayout()->blockBoundingRect(block).top() > top;
    };
    const auto next = std::find_if(m_headings.begin(), m_headings.end(), isBelow);
    return int(next - m_headings.begin()) - 1;
}

void KvDeskGuideText::showHeading(int index)
{
    // The title with the margin above it.
    const Heading &heading = m_headings.at(index);
    setSource(QUrl(heading.position == 0 ? QStringLiteral("#") : QLatin1Char('#') + heading.anchor));
}

void KvDeskGuideText::slotScrolled()
{
    emit signalHeadingInViewChanged(headingInView());
}

void KvDeskGuideText::slotOpenLink(const QUrl &aUrl)
{
    const bool isInText = aUrl.scheme().isEmpty() && aUrl.path().isEmpty();
    if (isInText)
        setSource(aUrl);
    else
        QDesktopServices::openUrl(QUrl::fromLocalFile(m_folder + QLatin1Char('/')).resolved(aUrl));
}

bool KvDeskGuideText::select(const QString &text, const QTextCursor &from, QTextDocument::FindFlags flags)
{
    QTextCursor found = document()->find(text, from, flags);
    if (found.isNull()) {
        QTextCursor otherEnd(document());
        if (flags & QTextDocument::FindBackward)
            otherEnd.movePosition(QTextCursor::End);
        found = document()->find(text, otherEnd, flags);
    }
    if (!found.isNull())
        setTextCursor(found);
    return !found.isNull();
}

bool KvDeskGuideText::findNext(const QString &text)
{
    return select(text, textCursor(), {});
}

bool KvDeskGuideText::findPrevious(const QString &text)
{
    return select(text, textCursor(), QTextDocument::FindBackward);
}

bool KvDeskGuideText::findTyped(const QString &text)
{
    QTextCursor start = textCursor();
    start.setPosition(start.selectionStart());
    return select(text, start, {});
}

void KvDeskGuideText::setZoom(int percent)
{
    m_zoom = qBound(smallestZoom, percent, largestZoom);
    QFont zoomed = QApplication::font();
    const QFontInfo normal(zoomed);
    zoomed.setPixelSize(qMax(1, normal.pixelSize() * m_zoom / 100));
    setFont(zoomed);
}

void KvDeskGuideText::slotZoomIn()
{
    setZoom(m_zoom + zoomStep);
}

void KvDeskGuideText::slotZoomOut()
{
    setZoom(m_zoom - zoomStep);
}

void KvDeskGuideText::slotZoomNormal()
{
    setZoom(100);
}

QMimeData *KvDeskGuideText::createMimeDataFromSelection() const
{
    QMimeData *const copied = QTextBrowser::createMimeDataFromSelection();
    copied->setText(ZtLeftToRight::plain(copied->text().remove(bulletSpacer)));
    copied->setHtml(ZtLeftToRight::plain(copied->html().remove(bulletSpacer)));
    return copied;
}

void KvDeskGuideText::wheelEvent(QWheelEvent *event)
{
    const int turn = event->angleDelta().y();
    if (!(event->modifiers() & Qt::ControlModifier))
        QTextBrowser::wheelEvent(event);
    else if (turn != 0)
        setZoom(m_zoom + (turn > 0 ? zoomStep : -zoomStep));
}

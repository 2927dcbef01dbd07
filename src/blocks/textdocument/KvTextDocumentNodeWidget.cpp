// SPDX-License-Identifier: MIT
#include "blocks/textdocument/KvTextDocumentNodeWidget.h"

#include "blocks/textdocument/KvRichTextGuard.h"
#include "blocks/textdocument/KvTextDocumentNodeCfg.h"
#include "blocks/textdocument/KvTextDocumentNodeOptionsWidget.h"
#include "blocks/textdocument/KvTextDocumentPicture.h"
#include "blocks/textdocument/KvTextPictureHandler.h"
#include "report/KvBaseDisplayWidgetSignals.h"
#include "templates/KvReportFont.h"
#include "templates/KvTemplateContext.h"

#include <QAbstractTextDocumentLayout>
#include <QFileInfo>
#include <QKeyEvent>
#include <QMimeData>
#include <QSignalBlocker>
#include <QTextDocument>
#include <QUrl>
#include <QWheelEvent>

#include <algorithm>
#include <memory>

namespace {

constexpr int kMinimumHeight = 10;

enum class FormatKey { None, Bold, Italic, Underline, Link };

FormatKey formatKeyOf(const QKeyEvent &event)
{
    if (event.matches(QKeySequence::Bold))
        return FormatKey::Bold;
    if (event.matches(QKeySequence::Italic))
        return FormatKey::Italic;
    if (event.matches(QKeySequence::Underline))
        return FormatKey::Underline;
    const QKeySequence keys(static_cast<int>(event.modifiers()) | event.key());
    return keys == KvTextDocumentNodeWidget::linkKeys() ? FormatKey::Link : FormatKey::None;
}

/** Office programs offer a picture of each text that is copied; pictures proper come without a text. */
bool isPictureAlone(const QMimeData &source)
{
    return source.hasImage() && source.text().trimmed().isEmpty();
}

/** The texts of \a source as they can be laid out. */
std::unique_ptr<QMimeData> tamedTexts(const QMimeData &source)
{
    const QString ownFormat = QStringLiteral("application/x-qrichtext");
    auto tamed = std::make_unique<QMimeData>();
    if (source.hasFormat(ownFormat))
        tamed->setData(ownFormat, KvRichTextGuard::tamed(QString::fromUtf8(source.data(ownFormat))).toUtf8());
    if (source.hasHtml())
        tamed->setHtml(KvRichTextGuard::tamed(source.html()));
    if (source.hasText())
        tamed->setText(KvRichTextGuard::tamedPlain(source.text()));
    return tamed;
}

} // namespace

KvTextDocumentNodeWidget::KvTextDocumentNodeWidget(QWidget *parent, KvTextDocumentNodeCfg *cfg)
    : QTextEdit(parent)
    , m_cfg(cfg)
{
    setUpView();
    setUpPaper();
    setEditable(false);
    applyPageWidth();
    connect(this, SIGNAL(textChanged()), this, SLOT(slotTextChanged()));
    refreshText();
}

void KvTextDocumentNodeWidget::setUpView()
{
    setSizePolicy(QSizePolicy::Preferred, QSizePolicy::Preferred);
    setSizeAdjustPolicy(QAbstractScrollArea::AdjustToContents);
    setFrameShape(QFrame::NoFrame);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    // Pages read from left to right whatever the language of the program; paragraphs still follow their own
    // script.
    setLayoutDirection(Qt::LeftToRight);
    // What is dropped on a text is meant for the page below it.
    setAcceptDrops(false);
    viewport()->setAcceptDrops(false);
}

void KvTextDocumentNodeWidget::setUpPaper()
{
    // Laid out for no device: the viewport would scale margins, pictures and point sizes by the screen's
    // resolution, and lines would break differently on every screen and in every program.
    document()->documentLayout()->setPaintDevice(nullptr);
    document()->documentLayout()->registerHandler(QTextFormat::ImageObject, new KvTextPictureHandler(this));
    document()->setDefaultFont(KvReportFont::make(KvReportFont::BodyPixelSize));
    setTextColor(QColor(QStringLiteral("black")));
    // Text without a colour of its own takes the palette's, which is that of a dark program around the white
    // page.
    QPalette paper = palette();
    paper.setColor(QPalette::Text, Qt::black);
    setPalette(paper);
    // A link would take, and store, the colour that the program's theme has for links at that time.
    document()->setDefaultStyleSheet(QStringLiteral("a { color: #00659D; }"));
}

QString KvTextDocumentNodeWidget::displayName() const
{
    return tr("Text");
}

QWidget *KvTextDocumentNodeWidget::subWidgetAt(int index)
{
    if (index != 0)
        return nullptr;
    // Placeholders are for the editor only.
    if (isEditing() && m_cfg->context() && m_cfg->context()->isPrinting()) {
        releaseOptionsWidget();
        endEditing();
    }
    applyPageWidth();
    return this;
}

QWidget *KvTextDocumentNodeWidget::createOptionsWidget(QWidget *parent, bool withPlacement)
{
    Q_UNUSED(withPlacement)
    if (isEditing())
        releaseOptionsWidget();
    else
        startEditing();
    m_optionsWidget = new KvTextDocumentNodeOptionsWidget(m_cfg, this, parent);
    connectOptionsWidget();
    return m_optionsWidget;
}

void KvTextDocumentNodeWidget::connectOptionsWidget()
{
    KvTextDocumentNodeOptionsWidget *options = m_optionsWidget;
    connect(options, SIGNAL(signalFontSizeChanged(uint)), this, SLOT(slotFontSizeChanged(uint)));
    connect(options, SIGNAL(signalTextColorChanged(QColor)), this, SLOT(slotTextColorChanged(QColor)));
    connect(options, SIGNAL(signalAlignmentChanged(Qt::Alignment)), this,
                            SLOT(slotAlignmentChanged(Qt::Alignment)));
    connect(options, SIGNAL(signalVAlignmentChanged(QTextCharFormat::VerticalAlignment)), this,
                            SLOT(slotVAlignmentChanged(QTextCharFormat::VerticalAlignment)));
    connect(options, SIGNAL(signalBoldChanged(bool)), this, SLOT(slotBoldChanged(bool)));
    connect(options, SIGNAL(signalItalicChanged(bool)), this, SLOT(slotItalicChanged(bool)));
    connect(options, SIGNAL(signalUnderlineChanged(bool)), this, SLOT(slotUnderlineChanged(bool)));
    connect(this, SIGNAL(currentCharFormatChanged(QTextCharFormat)), options, SLOT(slotStateChanged()));
    connect(this, SIGNAL(cursorPositionChanged()), options, SLOT(slotStateChanged()));
    connect(options, SIGNAL(destroyed()), this, SLOT(slotOptionsWidgetDestroyed()));
}

void KvTextDocumentNodeWidget::releaseOptionsWidget()
{
    // It stays its parent's to delete, which then no longer ends the editing.
    m_optionsWidget->disconnect(this);
    disconnect(m_optionsWidget);
    m_optionsWidget->setEnabled(false);
    m_optionsWidget.clear();
}

void KvTextDocumentNodeWidget::slotOptionsWidgetDestroyed()
{
    m_optionsWidget.clear();
    endEditing();
}

void KvTextDocumentNodeWidget::setEditable(bool editable)
{
    setReadOnly(!editable);
    // Read-only text could still be selected and would keep clicks and drags from the page.
    if (!editable)
        setTextInteractionFlags(Qt::NoTextInteraction);
    setFocusPolicy(editable ? Qt::StrongFocus : Qt::NoFocus);
    viewport()->setCursor(editable ? Qt::IBeamCursor : Qt::ArrowCursor);
}

void KvTextDocumentNodeWidget::startEditing()
{
    switchText(m_cfg->text());
    m_takenText = m_cfg->text();
    setEditable(true);
}

void KvTextDocumentNodeWidget::endEditing()
{
    setEditable(false);
    clearFocus();
    // The editor's form of a text that came from elsewhere differs from the text, edited or not. And what
    // came in meanwhile, as when a file is loaded, is newer than what was edited.
    if (document()->isModified() && m_cfg->text() == m_takenText)
        applyContent(Change::EndOfEditing);
    switchText(expandedText());
}

int KvTextDocumentNodeWidget::documentHeight() const
{
    return std::clamp(qRound(document()->size().height()), kMinimumHeight, QWIDGETSIZE_MAX);
}

QVariant KvTextDocumentNodeWidget::loadResource(int type, const QUrl &name)
{
    // A pipe or a device, which a damaged or hostile template may name, would never be read to its end. An
    // answer of no bytes keeps the document from opening it.
    if (name.scheme().isEmpty() || name.isLocalFile()) {
        const QFileInfo file(name.path());
        if (file.exists() && !file.isFile())
            return QByteArray("");
    }
    return QTextEdit::loadResource(type, name);
}

QSize KvTextDocumentNodeWidget::sizeHint() const
{
    // QTextEdit's own hint does not depend on the text.
    return QSize(width(), documentHeight());
}

QSize KvTextDocumentNodeWidget::minimumSizeHint() const
{
    return sizeHint();
}

QString KvTextDocumentNodeWidget::expandedText() const
{
    QString text = m_cfg->text();
    if (const KvTemplateContext *context = m_cfg->context())
        context->keywords().expand(text);
    return text;
}

void KvTextDocumentNodeWidget::refreshText()
{
    showText(expandedText());
}

bool KvTextDocumentNodeWidget::isUpToDate() const
{
    if (document()->isModified() || m_cfg->text() != m_shownSource)
        return false;
    // Without keywords both are the same string.
    return m_shownHtml == m_shownSource || m_shownHtml == expandedText();
}

void KvTextDocumentNodeWidget::showText(const QString &html)
{
    m_shownSource = m_cfg->text();
    m_shownHtml = html;
    const QSignalBlocker blocker(this);
    setHtml(KvRichTextGuard::tamed(html));
    updateHeight();
}

void KvTextDocumentNodeWidget::switchText(const QString &html)
{
    // Values need other room than their placeholders.
    const int heightBefore = height();
    showText(html);
    if (height() != heightBefore)
        emit displaySignals()->signalWidgetChanged();
}

void KvTextDocumentNodeWidget::applyPageWidth()
{
    const KvTemplateContext *context = m_cfg->context();
    if (!context)
        return;
    const int width = context->usableWidth();
    if (minimumWidth() == width && maximumWidth() == width)
        return;
    setFixedWidth(width);
    document()->setTextWidth(width);
    updateHeight();
}

void KvTextDocumentNodeWidget::updateHeight()
{
    const int height = documentHeight();
    setMinimumHeight(height);
    if (size() != sizeHint())
        resize(sizeHint());
    updateGeometry();
}

// ---- edits ----

void KvTextDocumentNodeWidget::slotTextChanged()
{
    const int heightBefore = height();
    updateHeight();
    applyContent(Change::Edit);
    if (height() != heightBefore)
        emit displaySignals()->signalWidgetChanged();
}

void KvTextDocumentNodeWidget::applyContent(Change change)
{
    const QString text = document()->isEmpty() ? QString() : toHtml();
    KvTemplateContext *context = m_cfg->context();
    m_takenText = text;
    if (m_cfg->setText(text)) {
        emit displaySignals()->signalWidgetConfigChanged(m_cfg);
        if (context)
            emit context->signalTemplateModified();
    }
    if (context && change == Change::Edit)
        emit context->signalTemplateModified();
}

qreal KvTextDocumentNodeWidget::fontSize() const
{
    const qreal pointSize = fontPointSize();
    return pointSize > 0 ? pointSize : QFontInfo(currentFont()).pointSizeF();
}

bool KvTextDocumentNodeWidget::isBold() const
{
    return fontWeight() >= QFont::Bold;
}

void KvTextDocumentNodeWidget::slotFontSizeChanged(unsigned int aPointSize)
{
    setFontPointSize(aPointSize);
    takeFocusBack();
}

void KvTextDocumentNodeWidget::slotTextColorChanged(const QColor &aColor)
{
    setTextColor(aColor);
    takeFocusBack();
}

void KvTextDocumentNodeWidget::slotAlignmentChanged(Qt::Alignment aAlignment)
{
    setAlignment(aAlignment);
    takeFocusBack();
}

void KvTextDocumentNodeWidget::slotVAlignmentChanged(QTextCharFormat::VerticalAlignment aAlignment)
{
    QTextCharFormat format;
    format.setVerticalAlignment(aAlignment);
    mergeCurrentCharFormat(format);
    takeFocusBack();
}

void KvTextDocumentNodeWidget::slotBoldChanged(bool aBold)
{
    setFontWeight(aBold ? QFont::Bold : QFont::Normal);
    takeFocusBack();
}

void KvTextDocumentNodeWidget::slotItalicChanged(bool aItalic)
{
    setFontItalic(aItalic);
    takeFocusBack();
}

void KvTextDocumentNodeWidget::slotUnderlineChanged(bool aUnderline)
{
    setFontUnderline(aUnderline);
    takeFocusBack();
}

void KvTextDocumentNodeWidget::takeFocusBack()
{
    setFocus(Qt::OtherFocusReason);
    emit displaySignals()->signalFocusBackToPageView();
}

void KvTextDocumentNodeWidget::insertPicture(const QPixmap &picture, int width, const QString &placement)
{
    const QString html = KvTextDocumentPicture::html(picture, width, placement);
    if (html.isEmpty())
        return;
    insertHtml(html);
    takeFocusBack();
}

// ---- events ----

QKeySequence KvTextDocumentNodeWidget::linkKeys()
{
    return QKeySequence(QStringLiteral("Ctrl+K"));
}

bool KvTextDocumentNodeWidget::event(QEvent *event)
{
    // Keys of the text come before the same keys of the window's menus.
    if (event->type() == QEvent::ShortcutOverride && isEditing() &&
        formatKeyOf(*static_cast<QKeyEvent *>(event)) != FormatKey::None) {
        event->accept();
        return true;
    }
    return QTextEdit::event(event);
}

void KvTextDocumentNodeWidget::keyPressEvent(QKeyEvent *event)
{
    switch (isEditing() ? formatKeyOf(*event) : FormatKey::None) {
    case FormatKey::Bold:
        slotBoldChanged(!isBold());
        break;
    case FormatKey::Italic:
        slotItalicChanged(!fontItalic());
        break;
    case FormatKey::Underline:
        slotUnderlineChanged(!fontUnderline());
        break;
    case FormatKey::Link:
        m_optionsWidget->slotLinkClicked();
        break;
    case FormatKey::None:
        QTextEdit::keyPressEvent(event);
        break;
    }
}

void KvTextDocumentNodeWidget::wheelEvent(QWheelEvent *event)
{
    // All of the text is in view: the wheel scrolls the pages. QTextEdit would zoom read-only text.
    event->ignore();
}

void KvTextDocumentNodeWidget::showEvent(QShowEvent *event)
{
    // The view's layout may have changed the text's width while the widget was hidden.
    updateHeight();
    QTextEdit::showEvent(event);
}

bool KvTextDocumentNodeWidget::canInsertFromMimeData(const QMimeData *source) const
{
    return (source && isPictureAlone(*source)) || QTextEdit::canInsertFromMimeData(source);
}

void KvTextDocumentNodeWidget::insertFromMimeData(const QMimeData *source)
{
    if (!source || isReadOnly())
        return;
    if (!isPictureAlone(*source)) {
        QTextEdit::insertFromMimeData(tamedTexts(*source).get());
        return;
    }
    const QPixmap picture = QPixmap::fromImage(qvariant_cast<QImage>(source->imageData()));
    insertPicture(picture, std::min(picture.width(), width()),
                  QLatin1String(KvTextDocumentPicture::NotFloating));
}

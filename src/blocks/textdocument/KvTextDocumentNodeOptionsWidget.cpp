// SPDX-License-Identifier: MIT
#include "blocks/textdocument/KvTextDocumentNodeOptionsWidget.h"

#include "blocks/textdocument/KvAddImageDialog.h"
#include "blocks/textdocument/KvAddLinkDialog.h"
#include "blocks/textdocument/KvTextDocumentNodeCfg.h"
#include "blocks/textdocument/KvTextDocumentNodeWidget.h"
#include "blocks/textdocument/KvTextDocumentPicture.h"
#include "gui/acss.h"
#include "templates/KvTemplateContext.h"
#include "widgets/KvColorLabel.h"

#include <QComboBox>
#include <QFontDatabase>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QPushButton>
#include <QSignalBlocker>
#include <QTextCursor>

namespace {

constexpr int kIconExtent = 24; // pixels
constexpr int kIconMode = 6;
constexpr int kButtonSpacing = 4;
constexpr int kFontSizeWidth = 68; // as wide as two buttons
constexpr int kGroupSpacing = 16;

// 32 pixels with the border. The padding of push buttons in general would leave no room for an icon.
const char kButtonStyle[] = "QPushButton { padding: 0px; min-width: 30px; max-width: 30px;"
                            " min-height: 30px; max-height: 30px; }";

QString withKeys(const QString &text, const QKeySequence &keys)
{
    return QStringLiteral("%1 (%2)").arg(text, keys.toString(QKeySequence::NativeText));
}

} // namespace

KvTextDocumentNodeOptionsWidget::KvTextDocumentNodeOptionsWidget(const KvTextDocumentNodeCfg *cfg,
                                                                 KvTextDocumentNodeWidget *text,
                                                                 QWidget *parent)
    : KvBaseOptionsWidget(text ? text->displayName() : tr("Text"), parent)
    , m_text(text)
{
    qRegisterMetaType<Qt::Alignment>("Qt::Alignment");
    qRegisterMetaType<QTextCharFormat::VerticalAlignment>("QTextCharFormat::VerticalAlignment");
    addFontRow();
    addCharacterRow();
    addAlignmentRow();
    addInsertRow();
    addTagRow(cfg);
    connectSignals();
    slotStateChanged();
}

void KvTextDocumentNodeOptionsWidget::setFromConfig(const KvBaseEditorNodeCfg *cfg)
{
    Q_UNUSED(cfg)
    slotStateChanged();
}

// ---- controls ----

QHBoxLayout *KvTextDocumentNodeOptionsWidget::addButtonRow()
{
    auto *row = new QWidget(this);
    row->setStyleSheet(QLatin1String(kButtonStyle));
    auto *layout = new QHBoxLayout(row);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(kButtonSpacing);
    layout->setAlignment(Qt::AlignLeft);
    addRow(row);
    return layout;
}

void KvTextDocumentNodeOptionsWidget::addFontRow()
{
    QHBoxLayout *row = addButtonRow();
    m_fontSizeBox = new QComboBox(row->parentWidget());
    const QList<int> sizes = QFontDatabase::standardSizes();
    for (const int size : sizes)
        m_fontSizeBox->addItem(QString::number(size), size);
    m_fontSizeBox->setFixedWidth(kFontSizeWidth);
    m_fontSizeBox->setToolTip(tr("Font size in points"));
    m_fontSizeBox->setAccessibleName(tr("Font size"));
    row->addWidget(m_fontSizeBox);

    m_colorLabel = new KvColorLabel(row->parentWidget());
    m_colorLabel->setToolTip(tr("Text color"));
    m_colorLabel->setAccessibleName(tr("Text color"));
    row->addWidget(m_colorLabel);
}

void KvTextDocumentNodeOptionsWidget::addCharacterRow()
{
    QHBoxLayout *row = addButtonRow();
    m_boldButton =
        addLetterButton(row, QStringLiteral("B"), QStringLiteral("QPushButton { font: bold 14px; }"),
                        withKeys(tr("Bold"), QKeySequence::Bold));
    m_italicButton =
        addLetterButton(row, QStringLiteral("I"), QStringLiteral("QPushButton { font: italic 14px; }"),
                        withKeys(tr("Italic"), QKeySequence::Italic));
    m_underlineButton = addLetterButton(
        row, QStringLiteral("U"), QStringLiteral("QPushButton{font: 14px; text-decoration: underline; }"),
        withKeys(tr("Underline"), QKeySequence::Underline));
}

void KvTextDocumentNodeOptionsWidget::addAlignmentRow()
{
    QHBoxLayout *row = addButtonRow();
    m_leftButton = addIconButton(row, QStringLiteral("Icons/IconTextAlignLeft.svg"), tr("Align left"));
    m_centerButton = addIconButton(row, QStringLiteral("Icons/IconTextAlignCenter.svg"), tr("Align center"));
    m_rightButton = addIconButton(row, QStringLiteral("Icons/IconTextAlignRight.svg"), tr("Align right"));
    m_justifyButton = addIconButton(row, QStringLiteral("Icons/IconTextAlignScatter.svg"), tr("Justify"));
}

void KvTextDocumentNodeOptionsWidget::addInsertRow()
{
    QHBoxLayout *row = addButtonRow();
    m_superscriptButton =
        addIconButton(row, QStringLiteral("Icons/IconTextSuperscript.svg"), tr("Superscript"));
    m_subscriptButton = addIconButton(row, QStringLiteral("Icons/IconTextSubscript.svg"), tr("Subscript"));
    row->addSpacing(kGroupSpacing - kButtonSpacing);
    m_linkButton = addIconButton(row, QStringLiteral("Icons/IconLink.svg"),
                                 withKeys(tr("Insert link"), KvTextDocumentNodeWidget::linkKeys()), false);
    m_galleryButton =
        addIconButton(row, QStringLiteral("Icons/IconGallery.svg"), tr("Insert picture"), false);
}

void KvTextDocumentNodeOptionsWidget::addTagRow(const KvTextDocumentNodeCfg *cfg)
{
    m_tagBox = new QComboBox(this);
    m_tagBox->addItem(tr("Insert tag"));
    if (const KvTemplateContext *context = cfg->context()) {
        for (const KvReportKeyword &keyword : context->keywords().keywords())
            m_tagBox->addItem(keyword.label, keyword.keyword);
    }
    m_tagBox->setToolTip(tr("Insert a tag that the report replaces by its value"));
    m_tagBox->setAccessibleName(tr("Insert tag"));
    m_tagBox->installEventFilter(this);
    addRow(m_tagBox);
}

QPushButton *KvTextDocumentNodeOptionsWidget::addButton(QHBoxLayout *row, const QString &text,
                                                        bool isCheckable)
{
    auto *button = new QPushButton(row->parentWidget());
    button->setCheckable(isCheckable);
    button->setToolTip(text);
    button->setAccessibleName(text);
    row->addWidget(button);
    return button;
}

QPushButton *KvTextDocumentNodeOptionsWidget::addLetterButton(QHBoxLayout *row, const QString &letter,
                                                              const QString &style, const QString &text)
{
    QPushButton *button = addButton(row, text, true);
    button->setText(letter);
    button->setStyleSheet(style);
    return button;
}

QPushButton *KvTextDocumentNodeOptionsWidget::addIconButton(QHBoxLayout *row, const QString &iconPath,
                                                            const QString &text, bool isCheckable)
{
    const QSize iconSize(kIconExtent, kIconExtent);
    QPushButton *button = addButton(row, text, isCheckable);
    button->setIconSize(iconSize);
    button->setIcon(acss::createIcon(kIconMode, iconPath, iconSize));
    return button;
}

void KvTextDocumentNodeOptionsWidget::connectSignals()
{
    connect(m_fontSizeBox, SIGNAL(currentIndexChanged(int)), this, SLOT(slotFontSizeSelected(int)));
    connect(m_colorLabel, SIGNAL(signalColorChanged(QColor)), this, SIGNAL(signalTextColorChanged(QColor)));
    connect(m_boldButton, SIGNAL(clicked(bool)), this, SIGNAL(signalBoldChanged(bool)));
    connect(m_italicButton, SIGNAL(clicked(bool)), this, SIGNAL(signalItalicChanged(bool)));
    connect(m_underlineButton, SIGNAL(clicked(bool)), this, SIGNAL(signalUnderlineChanged(bool)));
    connect(m_leftButton, SIGNAL(clicked(bool)), this, SLOT(slotAlignLeftClicked()));
    connect(m_centerButton, SIGNAL(clicked(bool)), this, SLOT(slotAlignCenterClicked()));
    connect(m_rightButton, SIGNAL(clicked(bool)), this, SLOT(slotAlignRightClicked()));
    connect(m_justifyButton, SIGNAL(clicked(bool)), this, SLOT(slotAlignJustifyClicked()));
    connect(m_superscriptButton, SIGNAL(clicked(bool)), this, SLOT(slotSuperscriptClicked(bool)));
    connect(m_subscriptButton, SIGNAL(clicked(bool)), this, SLOT(slotSubscriptClicked(bool)));
    connect(m_linkButton, SIGNAL(clicked(bool)), this, SLOT(slotLinkClicked()));
    connect(m_galleryButton, SIGNAL(clicked(bool)), this, SLOT(slotGalleryClicked()));
    connect(m_tagBox, SIGNAL(currentIndexChanged(int)), this, SLOT(slotTagSelected(int)));
}

// ---- formats ----

void KvTextDocumentNodeOptionsWidget::slotStateChanged()
{
    if (!m_text)
        return;
    const QTextCharFormat format = m_text->currentCharFormat();
    {
        const QSignalBlocker sizeBlocker(m_fontSizeBox);
        m_fontSizeBox->setCurrentIndex(m_fontSizeBox->findData(qRound(m_text->fontSize())));
        const QSignalBlocker colorBlocker(m_colorLabel);
        m_colorLabel->setColor(m_text->textColor());
    }
    m_boldButton->setChecked(m_text->isBold());
    m_italicButton->setChecked(format.fontItalic());
    m_underlineButton->setChecked(format.fontUnderline());
    checkAlignment(m_text->alignment());
    checkVAlignment(format.verticalAlignment());
}

void KvTextDocumentNodeOptionsWidget::slotFontSizeSelected(int aIndex)
{
    if (aIndex >= 0)
        emit signalFontSizeChanged(m_fontSizeBox->itemData(aIndex).toUInt());
}

void KvTextDocumentNodeOptionsWidget::checkAlignment(Qt::Alignment alignment)
{
    // Centred paragraphs of files lack the vertical flag of Qt::AlignCenter.
    m_leftButton->setChecked(alignment.testFlag(Qt::AlignLeft));
    m_centerButton->setChecked(alignment.testFlag(Qt::AlignHCenter));
    m_rightButton->setChecked(alignment.testFlag(Qt::AlignRight));
    m_justifyButton->setChecked(alignment.testFlag(Qt::AlignJustify));
}

void KvTextDocumentNodeOptionsWidget::checkVAlignment(QTextCharFormat::VerticalAlignment alignment)
{
    m_superscriptButton->setChecked(alignment == QTextCharFormat::AlignSuperScript);
    m_subscriptButton->setChecked(alignment == QTextCharFormat::AlignSubScript);
}

void KvTextDocumentNodeOptionsWidget::selectAlignment(Qt::Alignment alignment)
{
    checkAlignment(alignment);
    emit signalAlignmentChanged(alignment);
}

void KvTextDocumentNodeOptionsWidget::selectVAlignment(QTextCharFormat::VerticalAlignment alignment)
{
    checkVAlignment(alignment);
    emit signalVAlignmentChanged(alignment);
}

void KvTextDocumentNodeOptionsWidget::slotAlignLeftClicked()
{
    selectAlignment(Qt::AlignLeft);
}

void KvTextDocumentNodeOptionsWidget::slotAlignCenterClicked()
{
    selectAlignment(Qt::AlignCenter);
}

void KvTextDocumentNodeOptionsWidget::slotAlignRightClicked()
{
    selectAlignment(Qt::AlignRight);
}

void KvTextDocumentNodeOptionsWidget::slotAlignJustifyClicked()
{
    selectAlignment(Qt::AlignJustify);
}

void KvTextDocumentNodeOptionsWidget::slotSuperscriptClicked(bool aOn)
{
    selectVAlignment(aOn ? QTextCharFormat::AlignSuperScript : QTextCharFormat::AlignNormal);
}

void KvTextDocumentNodeOptionsWidget::slotSubscriptClicked(bool aOn)
{
    selectVAlignment(aOn ? QTextCharFormat::AlignSubScript : QTextCharFormat::AlignNormal);
}

// ---- insertions ----

void KvTextDocumentNodeOptionsWidget::slotLinkClicked()
{
    if (!m_text)
        return;
    // Panel and text may go while the dialog is open, or a print may end the editing. The dialog is no child
    // of the panel, whose buttons look different.
    const QPointer<KvTextDocumentNodeOptionsWidget> guard(this);
    const QPointer<KvAddLinkDialog> dialog(new KvAddLinkDialog(m_text->fontSize(), window()));
    dialog->setTitle(
        m_text->textCursor().selectedText().replace(QChar::ParagraphSeparator, QLatin1Char(' ')));
    const bool isAccepted = dialog->exec() == QDialog::Accepted;
    if (guard && m_text && m_text->isEditing() && dialog && isAccepted) {
        m_text->insertHtml(dialog->html());
        m_text->takeFocusBack();
    }
    delete dialog;
}

void KvTextDocumentNodeOptionsWidget::slotGalleryClicked()
{
    if (!m_text)
        return;
    const QPointer<KvTextDocumentNodeOptionsWidget> guard(this);
    const QPointer<KvAddImageDialog> dialog(new KvAddImageDialog(window()));
    const bool isAccepted = dialog->exec() == QDialog::Accepted;
    if (guard && m_text && m_text->isEditing() && dialog && isAccepted && !dialog->selectedFile().isEmpty()) {
        const int width = m_text->width() * dialog->widthPercent() / 100;
        m_text->insertPicture(QPixmap(dialog->selectedFile()), width, dialog->placement());
    }
    delete dialog;
}

void KvTextDocumentNodeOptionsWidget::slotTagSelected(int aIndex)
{
    if (aIndex <= 0)
        return;
    if (m_text) {
        m_text->insertPlainText(m_tagBox->itemData(aIndex).toString());
        m_text->takeFocusBack();
    }
    const QSignalBlocker blocker(m_tagBox);
    m_tagBox->setCurrentIndex(0);
}

bool KvTextDocumentNodeOptionsWidget::eventFilter(QObject *watched, QEvent *event)
{
    if (watched != m_tagBox)
        return KvBaseOptionsWidget::eventFilter(watched, event);
    // Stepping through the closed list would insert one tag after the other.
    if (event->type() == QEvent::Wheel) {
        event->ignore();
        return true;
    }
    if (event->type() != QEvent::KeyPress)
        return false;
    const int key = static_cast<QKeyEvent *>(event)->key();
    if (key != Qt::Key_Down && key != Qt::Key_Up)
        return false;
    m_tagBox->showPopup();
    return true;
}

// SPDX-License-Identifier: MIT
#include "blocks/textdocument/KvTextDocumentNodeWidget.h"

#include "blocks/textdocument/KvRichTextGuard.h"
#include "blocks/textdocument/KvTextDocumentNodeCfg.h"
#include "report/KvBaseDisplayWidgetSignals.h"
#include "templates/KvReportFont.h"
#include "templates/KvTemplateContext.h"

#include <QAbstractTextDocumentLayout>
#include <QSignalBlocker>
#include <QTextDocument>

#include <algorithm>

namespace {

constexpr int kMinimumHeight = 10;

} // namespace

KvTextDocumentNodeWidget::KvTextDocumentNodeWidget(QWidget *parent, KvTextDocumentNodeCfg *cfg)
    : QTextEdit(parent)
    , m_cfg(cfg)
{
    setSizePolicy(QSizePolicy::Preferred, QSizePolicy::Preferred);
    setSizeAdjustPolicy(QAbstractScrollArea::AdjustToContents);
    setFrameShape(QFrame::NoFrame);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    // Pages read from left to right whatever the language of the program; paragraphs still follow their own
    // script.
    setLayoutDirection(Qt::LeftToRight);
    // Laid out for no device: the viewport would scale margins, pictures and point sizes by the screen's
    // resolution, and lines would break differently on every screen and in every program.
    document()->documentLayout()->setPaintDevice(nullptr);
    document()->setDefaultFont(KvReportFont::make(KvReportFont::BodyPixelSize));
    setTextColor(QColor(QStringLiteral("black")));
    // Text without a colour of its own takes the palette's, which is that of a dark program around the white
    // page.
    QPalette paper = palette();
    paper.setColor(QPalette::Text, Qt::black);
    setPalette(paper);
    applyPageWidth();
    connect(this, SIGNAL(textChanged()), this, SLOT(slotTextChanged()));
    refreshText();
}

QString KvTextDocumentNodeWidget::displayName() const
{
    return tr("Text");
}

QWidget *KvTextDocumentNodeWidget::subWidgetAt(int index)
{
    if (index != 0)
        return nullptr;
    applyPageWidth();
    return this;
}

QWidget *KvTextDocumentNodeWidget::createOptionsWidget(QWidget *parent, bool withPlacement)
{
    Q_UNUSED(parent)
    Q_UNUSED(withPlacement)
    return nullptr;
}

int KvTextDocumentNodeWidget::documentHeight() const
{
    return std::max(qRound(document()->size().height()), kMinimumHeight);
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

void KvTextDocumentNodeWidget::refreshText()
{
    QString text = m_cfg->text();
    if (const KvTemplateContext *context = m_cfg->context())
        context->keywords().expand(text);
    const QSignalBlocker blocker(this);
    setHtml(KvRichTextGuard::tamed(text));
    updateHeight();
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

void KvTextDocumentNodeWidget::slotTextChanged()
{
    const int heightBefore = height();
    updateHeight();
    applyContent();
    if (height() != heightBefore)
        emit displaySignals()->signalWidgetChanged();
}

void KvTextDocumentNodeWidget::applyContent()
{
    const QString text = document()->isEmpty() ? QString() : toHtml();
    KvTemplateContext *context = m_cfg->context();
    if (m_cfg->setText(text)) {
        emit displaySignals()->signalWidgetConfigChanged(m_cfg);
        if (context)
            emit context->signalTemplateModified();
    }
    if (context)
        emit context->signalTemplateModified();
}

void KvTextDocumentNodeWidget::showEvent(QShowEvent *event)
{
    // The view's layout may have changed the text's width while the widget was hidden.
    updateHeight();
    QTextEdit::showEvent(event);
}

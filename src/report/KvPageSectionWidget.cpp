// SPDX-License-Identifier: MIT
#include "report/KvPageSectionWidget.h"

#include "templates/KvPageSectionsCfg.h"
#include "templates/KvTemplateContext.h"

#include <QScopedValueRollback>

KvPageSectionWidget::KvPageSectionWidget(QWidget *displayParent, KvPageSectionsCfg *section)
    : KvTextDocumentNodeWidget(displayParent, section)
{
    if (KvTemplateContext *context = section->context())
        connect(context, SIGNAL(signalTemplateModified()), this, SLOT(slotTemplateModified()));
}

void KvPageSectionWidget::fitToWidth(int width)
{
    setFixedWidth(width);
    ensurePolished();
    document()->setTextWidth(width);
    resize(sizeHint());
}

void KvPageSectionWidget::slotTemplateModified()
{
    if (!m_updating)
        refreshText();
}

void KvPageSectionWidget::applyContent()
{
    // Taking the text over marks the template modified, which must not replace the text that is being typed.
    const QScopedValueRollback<bool> guard(m_updating, true);
    KvTextDocumentNodeWidget::applyContent();
}

void KvPageSectionWidget::resizeEvent(QResizeEvent *event)
{
    KvTextDocumentNodeWidget::resizeEvent(event);
    if (document()->textWidth() != width())
        document()->setTextWidth(width());
}

// SPDX-License-Identifier: MIT
#include "report/KvPageSectionWidget.h"

#include "report/KvBaseDisplayWidgetSignals.h"
#include "templates/KvPageSectionsCfg.h"
#include "templates/KvTemplateContext.h"

#include <QScopedValueRollback>

#include <utility>

KvPageSectionWidget::KvPageSectionWidget(QWidget *displayParent, KvPageSectionsCfg *section)
    : KvTextDocumentNodeWidget(displayParent, section)
{
    if (KvTemplateContext *context = section->context())
        connect(context, SIGNAL(signalTemplateModified()), this, SLOT(slotTemplateModified()));
}

void KvPageSectionWidget::fitToWidth(int width)
{
    m_sizeUnannounced = false;
    setFixedWidth(width);
    ensurePolished();
    // A document lays its text out anew even for the width that it has, and this is said to the sections of
    // all pages.
    if (document()->textWidth() != width)
        document()->setTextWidth(width);
    resize(sizeHint());
}

void KvPageSectionWidget::slotTemplateModified()
{
    // Keywords would be expanded under the user's hands, and stored so with the next key. The sections of all
    // pages hear of each key typed anywhere in the template: most have nothing new to show.
    if (m_updating || isEditing() || isUpToDate())
        return;
    const int heightBefore = height();
    refreshText();
    if (height() == heightBefore || m_sizeUnannounced)
        return;
    // Later, since the same happens to the section on all other pages: the first to announce it has the view
    // measure them all.
    m_sizeUnannounced = true;
    QMetaObject::invokeMethod(this, "slotAnnounceSize", Qt::QueuedConnection);
}

void KvPageSectionWidget::slotAnnounceSize()
{
    if (std::exchange(m_sizeUnannounced, false))
        emit displaySignals()->signalWidgetChanged();
}

void KvPageSectionWidget::applyContent(Change change)
{
    // Taking the text over marks the template modified, which must not replace the text that is being typed.
    const QScopedValueRollback<bool> guard(m_updating, true);
    KvTextDocumentNodeWidget::applyContent(change);
}

void KvPageSectionWidget::resizeEvent(QResizeEvent *event)
{
    KvTextDocumentNodeWidget::resizeEvent(event);
    if (document()->textWidth() != width())
        document()->setTextWidth(width());
}

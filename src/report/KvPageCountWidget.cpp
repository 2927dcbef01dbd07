// SPDX-License-Identifier: MIT
#include "report/KvPageCountWidget.h"

#include "templates/KvReportFont.h"

KvPageCountWidget::KvPageCountWidget(QWidget *parent, int pageIndex)
    : QLabel(parent)
    , m_pageIndex(pageIndex)
{
    setObjectName(QStringLiteral("pageCount"));
    setStyleSheet(QStringLiteral("QLabel{color: black;}"));
    // It stands on the page as a window of its own, which would paint the program's window colour over the
    // paper.
    setAttribute(Qt::WA_TranslucentBackground);
    // "1/10" must not turn around in a program that reads from right to left.
    setLayoutDirection(Qt::LeftToRight);
    // Plain text spares the check for rich text at each change.
    setTextFormat(Qt::PlainText);
    setFont(KvReportFont::make(KvReportFont::BodyPixelSize));
    setText(QString::number(m_pageIndex + 1));
    adjustSize();
}

void KvPageCountWidget::setTotal(int total)
{
    if (total == m_total)
        return;
    m_total = total;
    setText(QStringLiteral("%1/%2").arg(m_pageIndex + 1).arg(total));
}

QString KvPageCountWidget::displayName() const
{
    return tr("Page count");
}

QWidget *KvPageCountWidget::subWidgetAt(int index)
{
    Q_UNUSED(index)
    return this;
}

QWidget *KvPageCountWidget::createOptionsWidget(QWidget *parent, bool withPlacement)
{
    Q_UNUSED(parent)
    Q_UNUSED(withPlacement)
    return nullptr;
}

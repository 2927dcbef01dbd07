// SPDX-License-Identifier: MIT
#include "KvDeskElidedLabel.h"

#include <QPainter>
#include <QStyle>

QSize KvDeskElidedLabel::minimumSizeHint() const
{
    return QSize(fontMetrics().horizontalAdvance(QLatin1Char('m')) * 4, QLabel::minimumSizeHint().height());
}

QString KvDeskElidedLabel::shownText() const
{
    return fontMetrics().elidedText(text(), Qt::ElideRight, contentsRect().width());
}

void KvDeskElidedLabel::paintEvent(QPaintEvent *event)
{
    Q_UNUSED(event)
    QPainter painter(this);
    style()->drawItemText(&painter, contentsRect(),
                          static_cast<int>(QStyle::visualAlignment(layoutDirection(), alignment())),
                          palette(), isEnabled(), shownText(), foregroundRole());
}

void KvDeskElidedLabel::resizeEvent(QResizeEvent *event)
{
    QLabel::resizeEvent(event);
    updateToolTip();
}

void KvDeskElidedLabel::setDetails(const QString &details)
{
    m_details = details;
    updateToolTip();
}

void KvDeskElidedLabel::updateToolTip()
{
    const QString whole = shownText() == text() ? QString() : text();
    setToolTip(m_details.isEmpty() ? whole : m_details);
}

// SPDX-License-Identifier: MIT
#include "widgets/KvSideGroupWidget.h"

#include <QHBoxLayout>

namespace {
constexpr int kMargin = 6;
constexpr int kSpacing = 12;
} // namespace

KvSideGroupWidget::KvSideGroupWidget(QWidget *parent)
    : QFrame(parent)
    , m_row(new QHBoxLayout(this))
{
    m_row->setContentsMargins(kMargin, kMargin, kMargin, kMargin);
    m_row->setSpacing(kSpacing);
    m_row->setAlignment(Qt::AlignLeft);
}

void KvSideGroupWidget::addWidget(QWidget *widget)
{
    m_row->addWidget(widget);
}

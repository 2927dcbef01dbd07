// SPDX-License-Identifier: MIT
#include "blocks/common/KvBaseOptionsWidget.h"

#include "resources/KvReportResources.h"

#include <QLabel>
#include <QVBoxLayout>

namespace {
constexpr int kRowSpacing = 12;
}

KvBaseOptionsWidget::KvBaseOptionsWidget(const QString &heading, QWidget *parent)
    : QFrame(parent)
    , m_rows(new QVBoxLayout(this))
{
    KvReportResources::ensure();
    m_rows->setContentsMargins(0, 0, 0, 0);
    m_rows->setSpacing(kRowSpacing);
    m_rows->setAlignment(Qt::AlignTop);
    auto *header = new QLabel(heading, this);
    header->setObjectName(QStringLiteral("sideHeader"));
    header->setProperty("groupTitle", true);
    m_rows->addWidget(header);
}

void KvBaseOptionsWidget::addRow(QWidget *row)
{
    m_rows->addWidget(row);
}

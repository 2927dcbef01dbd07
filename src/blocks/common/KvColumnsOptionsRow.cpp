// SPDX-License-Identifier: MIT
#include "blocks/common/KvColumnsOptionsRow.h"

#include <QCheckBox>
#include <QLabel>
#include <QSignalBlocker>
#include <QVBoxLayout>

namespace {
constexpr int kSpacing = 4;
}

KvColumnsOptionsRow::KvColumnsOptionsRow(const QStringList &names, const QStringList &labels, QWidget *parent)
    : QWidget(parent)
    , m_names(names)
{
    auto *column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(kSpacing);
    column->addWidget(new QLabel(tr("Select columns:"), this));
    for (int i = 0; i < names.size(); ++i) {
        auto *box = new QCheckBox(labels.value(i, names.at(i)), this);
        m_boxes.append(box);
        column->addWidget(box);
        connect(box, SIGNAL(stateChanged(int)), this, SLOT(slotStateChanged(int)));
    }
}

void KvColumnsOptionsRow::setColumns(const QSet<QString> &columns)
{
    const QSignalBlocker blocker(this);
    for (int i = 0; i < m_boxes.size(); ++i)
        m_boxes.at(i)->setChecked(columns.contains(m_names.at(i)));
}

void KvColumnsOptionsRow::slotStateChanged(int aState)
{
    const int index = m_boxes.indexOf(qobject_cast<QCheckBox *>(sender()));
    if (index >= 0)
        emit signalColumnStateChanged(m_names.at(index), aState);
}

// SPDX-License-Identifier: MIT
#include "blocks/common/KvPictureOptionsWidget.h"

#include "blocks/common/KvAlignmentOptionsRow.h"
#include "blocks/common/KvPicturePlacement.h"
#include "blocks/common/KvRotationOptionsRow.h"
#include "blocks/common/KvWidthOptionsRow.h"

KvPictureOptionsWidget::KvPictureOptionsWidget(const QString &heading, QWidget *parent)
    : KvBaseOptionsWidget(heading, parent)
{
    qRegisterMetaType<Qt::Alignment>("Qt::Alignment");
}

void KvPictureOptionsWidget::addPictureRows(bool withPlacement)
{
    if (withPlacement) {
        m_widthRow = new KvWidthOptionsRow(this);
        addRow(m_widthRow);
        connect(m_widthRow, SIGNAL(signalWidthChanged(int)), this, SIGNAL(signalWidthChanged(int)));
    }
    m_rotationRow = new KvRotationOptionsRow(this);
    addRow(m_rotationRow);
    connect(m_rotationRow, SIGNAL(signalAngleIndexChanged()), this, SLOT(slotAngleIndexChanged()));
    if (withPlacement) {
        m_alignmentRow = new KvAlignmentOptionsRow(this);
        addRow(m_alignmentRow);
        connect(m_alignmentRow, SIGNAL(signalLeftClicked()), this, SLOT(slotAlignLeftClicked()));
        connect(m_alignmentRow, SIGNAL(signalCenterClicked()), this, SLOT(slotAlignCenterClicked()));
        connect(m_alignmentRow, SIGNAL(signalRightClicked()), this, SLOT(slotAlignRightClicked()));
    }
}

void KvPictureOptionsWidget::showPlacement(const KvPicturePlacement &placement)
{
    if (m_widthRow)
        m_widthRow->setWidthPercent(placement.widthPercent);
    m_rotationRow->setAngle(placement.rotation);
    showAlignment(placement.alignment);
}

void KvPictureOptionsWidget::showAlignment(Qt::Alignment alignment)
{
    if (m_alignmentRow)
        m_alignmentRow->setAlignment(alignment);
}

int KvPictureOptionsWidget::chosenAngle() const
{
    return m_rotationRow->angle();
}

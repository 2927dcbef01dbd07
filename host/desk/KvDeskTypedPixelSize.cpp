// SPDX-License-Identifier: MIT
#include "KvDeskTypedPixelSize.h"

#include "KvDeskNumberBox.h"
#include "KvDeskReason.h"
#include "gui/acss.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QToolButton>

namespace {

constexpr int boxWidth = 112;
constexpr int toolIconStyle = 6;
constexpr QSize iconSize(20, 20);
constexpr QSize buttonSize(28, 28);

} // namespace

KvDeskTypedPixelSize::KvDeskTypedPixelSize(QWidget *parent)
    : KvDeskCalibrationWay(parent)
{
    m_x = createBox(tr("Width of a pixel in micrometres"));
    m_y = createBox(tr("Height of a pixel in micrometres"));
    m_link = new QToolButton(this);
    m_link->setCheckable(true);
    m_link->setIcon(acss::createIcon(toolIconStyle, QStringLiteral("Icons/link"), iconSize));
    m_link->setIconSize(iconSize);
    m_link->setFixedSize(buttonSize);
    m_link->setToolTip(tr("Same size in both directions"));
    m_link->setAccessibleName(m_link->toolTip());

    auto *const row = new QHBoxLayout;
    row->addWidget(new QLabel(tr("Width"), this));
    row->addWidget(m_x);
    row->addWidget(m_link);
    row->addWidget(new QLabel(tr("Height"), this));
    row->addWidget(m_y);
    row->addWidget(new QLabel(QStringLiteral("μm"), this));
    row->addStretch();
    setContent(tr("Type how large a pixel of the image is in reality."), row);
    setTabOrder(m_x, m_link);
    setTabOrder(m_link, m_y);
    connectSignals();
    m_link->setChecked(true);
}

KvDeskNumberBox *KvDeskTypedPixelSize::createBox(const QString &name)
{
    auto *const box = new KvDeskNumberBox(this);
    box->setFixedWidth(boxWidth);
    box->setAccessibleName(name);
    return box;
}

void KvDeskTypedPixelSize::connectSignals()
{
    connect(m_x, SIGNAL(valueChanged(double)), this, SLOT(slotXChanged(double)));
    connect(m_y, SIGNAL(valueChanged(double)), this, SIGNAL(signalChanged()));
    connect(m_link, SIGNAL(toggled(bool)), this, SLOT(slotLinkToggled(bool)));
}

ZtCalibration KvDeskTypedPixelSize::calibration() const
{
    ZtCalibration result(m_x->value(), m_y->value());
    result.setOrigin(ZtCalibration::Origin::Typed);
    return result;
}

void KvDeskTypedPixelSize::setPixelSize(const ZtCalibration &calibration)
{
    m_link->setChecked(calibration.isSquare());
    m_x->setValue(calibration.micrometresPerPixelX());
    m_y->setValue(calibration.micrometresPerPixelY());
}

void KvDeskTypedPixelSize::slotXChanged(double aValue)
{
    if (m_link->isChecked())
        m_y->setValue(aValue);
    emit signalChanged();
}

void KvDeskTypedPixelSize::slotLinkToggled(bool aLinked)
{
    KvDeskReason::setPossible(m_y, !aLinked, m_link->toolTip());
    if (aLinked)
        m_y->setValue(m_x->value());
}

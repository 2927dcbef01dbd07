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
    connect(m_x, SIGNAL(valueChanged(double)), this, SLOT(slotXChanged()));
    connect(m_y, SIGNAL(valueChanged(double)), this, SLOT(slotYChanged()));
    connect(m_link, SIGNAL(toggled(bool)), this, SLOT(slotLinkToggled(bool)));
}

ZtCalibration KvDeskTypedPixelSize::calibration() const
{
    if (!fault().isEmpty())
        return ZtCalibration();
    ZtCalibration result(m_x->value(), m_y->value());
    result.setOrigin(ZtCalibration::Origin::Typed);
    return result;
}

QString KvDeskTypedPixelSize::fault() const
{
    return m_x->fault().isEmpty() ? m_y->fault() : m_x->fault();
}

void KvDeskTypedPixelSize::setPixelSize(const ZtCalibration &calibration)
{
    m_link->setChecked(calibration.isSquare());
    m_x->setValue(calibration.micrometresPerPixelX());
    m_y->setValue(calibration.micrometresPerPixelY());
}

void KvDeskTypedPixelSize::slotXChanged()
{
    m_x->setFault(faultOf(*m_x, m_x->value()));
    if (m_link->isChecked())
        followX();
    emit signalChanged();
}

void KvDeskTypedPixelSize::slotYChanged()
{
    m_y->setFault(faultOf(*m_y, m_y->value()));
    emit signalChanged();
}

// What is wrong is said once, where it can be mended.
void KvDeskTypedPixelSize::followX()
{
    m_y->setValue(m_x->fault().isEmpty() ? m_x->value() : 0.0);
}

void KvDeskTypedPixelSize::slotLinkToggled(bool aLinked)
{
    // First: what it says of itself makes room for the reason.
    if (aLinked)
        followX();
    KvDeskReason::setPossible(m_y, !aLinked, m_link->toolTip());
}

// SPDX-License-Identifier: MIT
#include "KvDeskExposureControl.h"

#include "KvDeskDecimalBox.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QSignalBlocker>
#include <QSlider>

#include <cmath>

namespace {

constexpr int spacing = 8;
constexpr int sliderWidth = 120;
constexpr int narrowSliderWidth = 64; ///< where there is little space
constexpr int numberWidth = 104;      ///< of the field, without the unit
constexpr int steps = 1000;           ///< of the slider
constexpr int decimals = 3;           ///< of milliseconds
constexpr double resolution = 0.001;  ///< milliseconds; a logarithm needs a smallest one

} // namespace

KvDeskExposureControl::KvDeskExposureControl(QWidget *parent)
    : QWidget(parent)
    , m_label(new QLabel(tr("E&xposure"), this))
    , m_slider(new QSlider(Qt::Horizontal, this))
    , m_field(new KvDeskDecimalBox(this))
{
    m_label->setBuddy(m_field);
    m_slider->setRange(0, steps);
    m_slider->setPageStep(steps / 20);
    m_slider->setMinimumWidth(narrowSliderWidth);
    m_slider->setMaximumWidth(sliderWidth);
    m_slider->setToolTip(tr("Exposure time of the camera"));
    m_slider->setAccessibleName(m_slider->toolTip());
    m_field->setDecimals(decimals);
    m_field->setSuffix(tr(" ms", "milliseconds"));
    m_field->setStepType(QAbstractSpinBox::AdaptiveDecimalStepType);
    // The camera gets what was typed to its end.
    m_field->setKeyboardTracking(false);
    m_field->setFixedWidth(numberWidth + m_field->fontMetrics().horizontalAdvance(m_field->suffix()));
    m_field->setToolTip(m_slider->toolTip());
    m_field->setAccessibleName(m_slider->toolTip());
    // Files are dropped on the window.
    m_field->findChild<QLineEdit *>()->setAcceptDrops(false);

    auto *const layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(spacing);
    layout->addWidget(m_label);
    layout->addWidget(m_slider);
    layout->addWidget(m_field);
    connect(m_slider, SIGNAL(valueChanged(int)), this, SLOT(slotSliderMoved(int)));
    connect(m_field, SIGNAL(valueChanged(double)), this, SLOT(slotFieldChanged(double)));
}

void KvDeskExposureControl::setCompact(bool isCompact)
{
    m_label->setVisible(!isCompact);
    m_slider->setVisible(!isCompact);
}

double KvDeskExposureControl::lowest() const
{
    return qMax(m_range.minimum, resolution);
}

double KvDeskExposureControl::exposureAt(int position) const
{
    const double ratio = qMax(1.0, m_range.maximum / lowest());
    return lowest() * std::pow(ratio, static_cast<double>(position) / steps);
}

int KvDeskExposureControl::positionOf(double milliseconds) const
{
    const double ratio = m_range.maximum / lowest();
    if (ratio <= 1.0 || milliseconds <= lowest())
        return 0;
    return qMin(steps,
                static_cast<int>(std::lround(steps * std::log(milliseconds / lowest()) / std::log(ratio))));
}

void KvDeskExposureControl::setExposure(const ZtExposureRange &range, double milliseconds)
{
    m_range = range;
    {
        const QSignalBlocker blocker(m_field);
        m_field->setRange(range.minimum, range.maximum);
        m_field->setValue(milliseconds);
    }
    // The camera's answer must not pull the slider from the user's hand.
    if (m_slider->isSliderDown())
        return;
    const QSignalBlocker blocker(m_slider);
    m_slider->setValue(positionOf(milliseconds));
}

void KvDeskExposureControl::slotSliderMoved(int aPosition)
{
    emit signalExposureChosen(exposureAt(aPosition));
}

void KvDeskExposureControl::slotFieldChanged(double aMilliseconds)
{
    emit signalExposureChosen(aMilliseconds);
}

// SPDX-License-Identifier: MIT
#include "KvDeskKnownDistance.h"

#include "KvDeskCalibrator.h"
#include "KvDeskNumberBox.h"
#include "KvDeskObjectEditor.h"
#include "KvDeskObjectState.h"
#include "KvDeskSelection.h"
#include "kernel/ZtLeftToRight.h"
#include "kernel/ZtSignalCenter.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtGeometry.h"
#include "measuring/ZtMeasureFormat.h"

#include <QComboBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>

namespace {

constexpr int lengthWidth = 112;
constexpr int standardUnit = 1;

struct Unit
{
    const char *text;
    double micrometres;
};

constexpr Unit units[] = {{"μm", 1.0},
                          {"mm", 1e3},
                          {"cm", 1e4},
                          {"m", 1e6},
                          {QT_TRANSLATE_NOOP("KvDeskKnownDistance", "inch"), 25400.0}};

// 0 for what is no line.
double lengthInPlane(const KvDeskObjectId &object, const ZtCalibration &calibration)
{
    const KvDeskObjectState state = KvDeskObjectState::of(object);
    const bool isLine = object.type == ZtDrawnType::Line && state.exists;
    return isLine ? ZtGeometry::pathLength(calibration.toPlane(state.points)) : 0.0;
}

} // namespace

KvDeskKnownDistance::KvDeskKnownDistance(KvDeskCalibrator *calibrator, QWidget *parent)
    : KvDeskCalibrationWay(parent)
    , m_calibrator(calibrator)
{
    createFields();
    connectSignals();
    slotSelectionChanged();
    slotUseSelected();
    refresh();
}

void KvDeskKnownDistance::createFields()
{
    m_text = new QLabel(this);
    m_use = new QPushButton(tr("Use selected line"), this);
    m_use->setAutoDefault(false);
    m_length = new KvDeskNumberBox(this);
    m_length->setFixedWidth(lengthWidth);
    m_length->setAccessibleName(tr("Length of the line"));
    m_unit = new QComboBox(this);
    m_unit->setAccessibleName(tr("Unit of the length"));
    for (const Unit &unit : units)
        m_unit->addItem(tr(unit.text), unit.micrometres);
    m_unit->setCurrentIndex(standardUnit);

    auto *const row = new QHBoxLayout;
    row->addWidget(m_use);
    row->addWidget(m_text, 1);
    row->addWidget(new QLabel(tr("Its length"), this));
    row->addWidget(m_length);
    row->addWidget(m_unit);
    setContent(tr("Draw a line over a distance that you know, such as on a stage micrometer, and select it."),
               row);
}

void KvDeskKnownDistance::connectSignals()
{
    connect(m_use, SIGNAL(clicked()), this, SLOT(slotUseSelected()));
    connect(m_length, SIGNAL(valueChanged(double)), this, SLOT(slotUpdate()));
    connect(m_unit, SIGNAL(currentIndexChanged(int)), this, SLOT(slotUpdate()));
    connect(m_calibrator->selection(), SIGNAL(signalSelectionChanged()), this, SLOT(slotSelectionChanged()));
    const ZtSignalCenter *const center = ZtSignalCenter::getInstance();
    connect(center, SIGNAL(signalObjectChanged(int,int,const ZtKernelObjectData*)), this,
                           SLOT(slotObjectChanged(int,int,const ZtKernelObjectData*)));
    connect(center, SIGNAL(signalObjectRemoved(int,int)), this, SLOT(slotObjectRemoved(int,int)));
}

// Until there is a line, any length may be right.
double KvDeskKnownDistance::pixelSize() const
{
    const double pixels = lengthInPlane(m_reference, m_calibrator->current());
    const double micrometres = m_length->value() * m_unit->currentData().toDouble();
    if (pixels > 0.0)
        return micrometres / pixels;
    return micrometres > 0.0 && qIsFinite(micrometres) ? 1.0 : 0.0;
}

QString KvDeskKnownDistance::fault() const
{
    return faultOf(*m_length, pixelSize());
}

ZtCalibration KvDeskKnownDistance::calibration() const
{
    const ZtCalibration shape = m_calibrator->current();
    if (!fault().isEmpty() || lengthInPlane(m_reference, shape) <= 0.0)
        return ZtCalibration();
    ZtCalibration result(pixelSize(), pixelSize() * shape.aspect());
    result.setOrigin(ZtCalibration::Origin::KnownDistance);
    return result;
}

bool KvDeskKnownDistance::canUseSelected() const
{
    const KvDeskSelection *const selection = m_calibrator->selection();
    return selection->objects().size() == 1 && lengthInPlane(selection->current(), ZtCalibration()) > 0.0;
}

QString KvDeskKnownDistance::referenceText() const
{
    return m_text->text();
}

void KvDeskKnownDistance::slotUpdate()
{
    refresh();
    emit signalChanged();
}

void KvDeskKnownDistance::refresh()
{
    m_length->setFault(fault());
    const double pixels = lengthInPlane(m_reference, m_calibrator->current());
    if (m_reference.isNull())
        m_text->setText(tr("No line yet"));
    else
        m_text->setText(tr("%1: %2", "name and length of a line")
                            .arg(KvDeskObjectEditor::describe({m_reference}),
                                 ZtLeftToRight::isolated(ZtMeasureFormat::pixelText(pixels, 1))));
}

void KvDeskKnownDistance::slotUseSelected()
{
    if (!canUseSelected())
        return;
    m_reference = m_calibrator->selection()->current();
    slotUpdate();
}

void KvDeskKnownDistance::slotSelectionChanged()
{
    m_use->setEnabled(canUseSelected());
    m_use->setToolTip(m_use->isEnabled() ? tr("Take the selected line as the known distance")
                                         : tr("Select one line on the image first"));
}

void KvDeskKnownDistance::slotObjectChanged(int aType, int aId, const ZtKernelObjectData *aObject)
{
    Q_UNUSED(aObject)
    slotSelectionChanged();
    if (m_reference != KvDeskObjectId{aType, aId})
        return;
    slotUpdate();
}

void KvDeskKnownDistance::slotObjectRemoved(int aType, int aId)
{
    const bool isOfMany = aType == m_reference.type && !KvDeskObjectState::of(m_reference).exists;
    if (!isOfMany && m_reference != KvDeskObjectId{aType, aId})
        return;
    m_reference = KvDeskObjectId();
    slotUpdate();
}

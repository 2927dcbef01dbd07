// SPDX-License-Identifier: MIT
#include "KvDeskFilePixelSize.h"

#include "KvDeskCalibrationText.h"
#include "KvDeskCalibrator.h"
#include "kernel/ZtLeftToRight.h"

#include <QLabel>
#include <QVBoxLayout>

KvDeskFilePixelSize::KvDeskFilePixelSize(KvDeskCalibrator *calibrator, QWidget *parent)
    : KvDeskCalibrationWay(parent)
    , m_calibrator(calibrator)
    , m_text(new QLabel(this))
{
    m_text->setWordWrap(true);
    m_text->setTextFormat(Qt::PlainText);
    auto *const layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(m_text);
    layout->addStretch();
    refresh();
}

ZtCalibration KvDeskFilePixelSize::calibration() const
{
    return m_calibrator->offered();
}

QString KvDeskFilePixelSize::text() const
{
    return m_text->text();
}

void KvDeskFilePixelSize::refresh()
{
    const ZtCalibration offered = m_calibrator->offered();
    m_text->setText(offered.isCalibrated() ? tr("%1 states pixels of %2.", "file, size")
                                                 .arg(ZtLeftToRight::isolated(offered.name()),
                                                      KvDeskCalibrationText::pixelSize(offered))
                                           : tr("The image's file does not state how large its pixels are."));
    emit signalChanged();
}

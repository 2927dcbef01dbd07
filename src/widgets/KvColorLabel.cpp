// SPDX-License-Identifier: MIT
#include "widgets/KvColorLabel.h"

#include <QColorDialog>
#include <QPointer>

namespace {
constexpr int kSwatchExtent = 24; // pixels
}

KvColorLabel::KvColorLabel(QWidget *parent)
    : QPushButton(parent)
{
    setObjectName(QStringLiteral("colorLabel"));
    setIconSize(QSize(kSwatchExtent, kSwatchExtent));
    setColor(Qt::cyan);
    connect(this, SIGNAL(clicked(bool)), this, SLOT(slotClicked()));
}

void KvColorLabel::setColor(const QColor &color)
{
    m_color = color;
    QPixmap swatch(kSwatchExtent, kSwatchExtent);
    swatch.fill(m_color);
    setIcon(swatch);
}

void KvColorLabel::slotClicked()
{
    // The button's panel may be closed while the dialog is open.
    const QPointer<KvColorLabel> guard(this);
    const QColor color =
        QColorDialog::getColor(m_color, nullptr, QString(), QColorDialog::ColorDialogOptions());
    if (!guard || !color.isValid() || color == m_color)
        return;
    setColor(color);
    emit signalColorChanged(m_color);
}

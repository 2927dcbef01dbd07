// SPDX-License-Identifier: MIT
#pragma once

#include "blocks/common/KvBaseOptionsWidget.h"

class KvAlignmentOptionsRow;
class KvRotationOptionsRow;
class KvWidthOptionsRow;
struct KvPicturePlacement;

/** Base of the options panels of blocks that show a picture: rows for its width, rotation and alignment. */
class KvPictureOptionsWidget : public KvBaseOptionsWidget
{
    Q_OBJECT
protected:
    KvPictureOptionsWidget(const QString &heading, QWidget *parent);

    /**
     * Adds the rows, those for width and alignment only \a withPlacement.
     *
     * Called by the constructor of the panel itself: it connects the rows by name to the panel's own
     * signalWidthChanged(int), slotAngleIndexChanged(), slotAlignLeftClicked(), slotAlignCenterClicked() and
     * slotAlignRightClicked().
     */
    void addPictureRows(bool withPlacement);

    void showPlacement(const KvPicturePlacement &placement); ///< emits nothing
    void showAlignment(Qt::Alignment alignment);
    int chosenAngle() const; ///< in degrees

private:
    KvWidthOptionsRow *m_widthRow = nullptr;
    KvRotationOptionsRow *m_rotationRow = nullptr;
    KvAlignmentOptionsRow *m_alignmentRow = nullptr;
};

// SPDX-License-Identifier: MIT
#pragma once

#include <QFrame>

class KvDeskToolBox;

/** Buttons of the measuring tools, one below the other. */
class KvDeskToolStrip : public QFrame
{
    Q_OBJECT
public:
    explicit KvDeskToolStrip(const KvDeskToolBox *toolBox, QWidget *parent = nullptr);
};

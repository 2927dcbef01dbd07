// SPDX-License-Identifier: MIT
#pragma once

#include "report/KvBaseDisplayWidget.h"

#include <QLabel>

/** The page number in a page's corner: "2" until the number of pages is known, "2/7" then. */
class KvPageCountWidget
    : public QLabel
    , public KvBaseDisplayWidget
{
    Q_OBJECT
public:
    /** \a pageIndex counts from 0. */
    KvPageCountWidget(QWidget *parent, int pageIndex);

    void setTotal(int total);

    QString displayName() const override;
    QWidget *subWidgetAt(int index) override;
    QWidget *createOptionsWidget(QWidget *parent, bool withPlacement) override;

private:
    int m_pageIndex;
    int m_total = 0;
};

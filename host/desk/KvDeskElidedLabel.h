// SPDX-License-Identifier: MIT
#pragma once

#include <QLabel>

/** A label of one line that is shortened where it does not fit; the tool tip then has the whole text. */
class KvDeskElidedLabel : public QLabel
{
    Q_OBJECT
public:
    using QLabel::QLabel;

    QSize minimumSizeHint() const override;

protected:
    void paintEvent(QPaintEvent *event) override;
    void resizeEvent(QResizeEvent *event) override;

private:
    QString shownText() const;
};

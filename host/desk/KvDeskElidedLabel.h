// SPDX-License-Identifier: MIT
#pragma once

#include <QLabel>

/** A label of one line that is shortened where it does not fit; the tool tip then has the whole text. */
class KvDeskElidedLabel : public QLabel
{
    Q_OBJECT
public:
    using QLabel::QLabel;

    /** What the tool tip says in any case, instead of the whole text where that is shortened. */
    void setDetails(const QString &details);

    QSize minimumSizeHint() const override;

protected:
    void paintEvent(QPaintEvent *event) override;
    void resizeEvent(QResizeEvent *event) override;

private:
    QString shownText() const;
    void updateToolTip();

    QString m_details;
};

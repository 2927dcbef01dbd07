// SPDX-License-Identifier: MIT
#pragma once

#include <QFrame>

class KvToolBase;
class QGridLayout;
class QScrollArea;
class QVBoxLayout;

/**
 * Column of the tools: their buttons in rows at the top, below them the panels of the active ones. As wide as
 * the widest panel whether that is shown or not, so that the image does not jump.
 */
class KvDeskToolColumn : public QFrame
{
    Q_OBJECT
public:
    explicit KvDeskToolColumn(QWidget *parent = nullptr);

    void addTool(KvToolBase *tool);

    QSize sizeHint() const override;
    QSize minimumSizeHint() const override;

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    QGridLayout *m_buttons = nullptr;
    QScrollArea *m_scrollArea = nullptr;
    QVBoxLayout *m_panels = nullptr;
    int m_toolCount = 0;
};

// SPDX-License-Identifier: MIT
#pragma once

#include <QFrame>

class KvBaseEditorNodeCfg;
class QVBoxLayout;

/** Base of all options panels: a heading and rows below it. */
class KvBaseOptionsWidget : public QFrame
{
    Q_OBJECT
public:
    explicit KvBaseOptionsWidget(const QString &heading, QWidget *parent = nullptr);

    /** Shows the settings of \a cfg in the controls; emits nothing. */
    virtual void setFromConfig(const KvBaseEditorNodeCfg *cfg) = 0;

protected:
    void addRow(QWidget *row);

private:
    QVBoxLayout *m_rows;
};

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
    static constexpr int ControlSpacing = 8; ///< between the controls of a row
    static constexpr int LabelWidth = 24;    ///< of the signs before the fields of a row
    static constexpr int FieldWidth = 88;    ///< of fields that hold a short number

    explicit KvBaseOptionsWidget(const QString &heading, QWidget *parent = nullptr);

    /** Shows the settings of \a cfg in the controls; emits nothing. */
    virtual void setFromConfig(const KvBaseEditorNodeCfg *cfg) = 0;

protected:
    void addRow(QWidget *row);

private:
    QVBoxLayout *m_rows;
};

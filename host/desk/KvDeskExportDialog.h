// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtTableExport.h"

#include <QDialog>

class QCheckBox;
class QComboBox;
class QDialogButtonBox;
class QFormLayout;
class QLabel;

/** Asks how measured values are to be exported. Choices are remembered once they were used. */
class KvDeskExportDialog : public QDialog
{
    Q_OBJECT
public:
    /** \a selection is what can be exported alone; without any, that cannot be chosen. */
    explicit KvDeskExportDialog(const QVector<ZtTableExport::ObjectId> &selection, QWidget *parent = nullptr);

    ZtTableExport::Options options() const;

    QComboBox *layoutBox() const { return m_layout; }
    QComboBox *numbersBox() const { return m_numbers; }
    QCheckBox *selectionBox() const { return m_selectionOnly; }
    QCheckBox *markBox() const { return m_mark; }
    QCheckBox *guardBox() const { return m_guard; }

public slots:
    void accept() override;

private slots:
    void slotUpdate();

private:
    void createFields();
    void fillLayouts();
    void fillNumbers();
    QFormLayout *createForm();
    void load();
    void store() const;
    ZtTableExport::Layout chosenLayout() const;

    QVector<ZtTableExport::ObjectId> m_selection;
    QComboBox *m_layout = nullptr;
    QComboBox *m_numbers = nullptr;
    QLabel *m_note = nullptr;
    QCheckBox *m_selectionOnly = nullptr;
    QCheckBox *m_mark = nullptr;
    QCheckBox *m_guard = nullptr;
    QDialogButtonBox *m_buttons = nullptr;
};

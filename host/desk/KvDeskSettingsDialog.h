// SPDX-License-Identifier: MIT
#pragma once

#include <QDialog>

class QComboBox;
class QDialogButtonBox;
class QFormLayout;
class QLabel;
class QSpinBox;

/** The settings of the program. Values are written, and thereby announced, by Ok and Apply. */
class KvDeskSettingsDialog : public QDialog
{
    Q_OBJECT
public:
    explicit KvDeskSettingsDialog(QWidget *parent = nullptr);

    QComboBox *themeBox() const { return m_theme; }
    QComboBox *languageBox() const { return m_language; }
    QSpinBox *digitsBox() const { return m_digits; }
    QComboBox *lengthUnitBox() const { return m_lengthUnit; }
    QComboBox *angleUnitBox() const { return m_angleUnit; }
    QDialogButtonBox *buttonBox() const { return m_buttons; }

public slots:
    void accept() override;
    /** Writes all settings. */
    void slotApply();

private slots:
    void slotValueChanged();

private:
    QFormLayout *createForm();
    void addAppearance(QFormLayout *form);
    void addMeasuredValues(QFormLayout *form);
    void addTitle(QFormLayout *form, const QString &title, int spaceAbove);
    QComboBox *createBox(const QString &name);
    void fillLanguages();
    void connectSignals();
    void load();
    QVariantList values() const;

    QComboBox *m_theme = nullptr;
    QComboBox *m_language = nullptr;
    QSpinBox *m_digits = nullptr;
    QComboBox *m_lengthUnit = nullptr;
    QComboBox *m_angleUnit = nullptr;
    QDialogButtonBox *m_buttons = nullptr;
    QVariantList m_written; ///< the values as they are stored
};

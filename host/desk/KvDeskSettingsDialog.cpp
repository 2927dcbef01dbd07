// SPDX-License-Identifier: MIT
#include "KvDeskSettingsDialog.h"

#include "KvDeskLanguages.h"
#include "KvDeskReason.h"
#include "KvDeskTheme.h"
#include "gui/QtAdvancedStylesheet.h"
#include "kernel/ZtAppSettings.h"

#include <QComboBox>
#include <QDialogButtonBox>
#include <QFormLayout>
#include <QLabel>
#include <QPushButton>
#include <QSpinBox>
#include <QVBoxLayout>

namespace {

constexpr int pageMargin = 24;
constexpr int groupSpacing = 16;
constexpr int rowSpacing = 8;
constexpr int fieldWidth = 240;
constexpr int maximumDigits = 15;

const char measurementGroup[] = "Measurement";
const char digitsKey[] = "MeasurementLabelsSignDigits";
const char lengthKey[] = "LengthUnit";
const char angleKey[] = "AngleUnit";
const char automatic[] = "auto";

// An unknown value stands for the first entry.
void choose(QComboBox *box, const QVariant &value)
{
    box->setCurrentIndex(qMax(0, box->findData(value)));
}

} // namespace

KvDeskSettingsDialog::KvDeskSettingsDialog(QWidget *parent)
    : QDialog(parent)
{
    setWindowTitle(tr("Settings"));
    m_buttons =
        new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel | QDialogButtonBox::Apply);
    m_buttons->button(QDialogButtonBox::Ok)->setDefault(true);

    auto *const layout = new QVBoxLayout(this);
    layout->setContentsMargins(pageMargin, pageMargin, pageMargin, pageMargin);
    layout->setSpacing(groupSpacing);
    QFormLayout *const form = createForm();
    addAppearance(form);
    addMeasuredValues(form);
    layout->addLayout(form);
    layout->addSpacing(rowSpacing);
    layout->addWidget(m_buttons);
    layout->setSizeConstraint(QLayout::SetFixedSize);

    load();
    connectSignals();
    slotValueChanged();
}

void KvDeskSettingsDialog::addAppearance(QFormLayout *form)
{
    addTitle(form, tr("Appearance"), 0);
    m_theme = createBox(tr("Theme"));
    m_theme->addItem(tr("Dark"), QStringLiteral("Dark"));
    m_theme->addItem(tr("Light"), QStringLiteral("Light"));
    form->addRow(tr("Theme"), m_theme);
    m_language = createBox(tr("Language"));
    fillLanguages();
    form->addRow(tr("Language"), m_language);
    auto *const note = new QLabel(tr("Another language takes effect when the program is started again."));
    note->setProperty("caption", true);
    note->setWordWrap(true);
    note->setFixedWidth(fieldWidth);
    form->addRow(QString(), note);
}

void KvDeskSettingsDialog::addMeasuredValues(QFormLayout *form)
{
    addTitle(form, tr("Measured values"), groupSpacing);
    m_digits = new QSpinBox;
    m_digits->setLocale(QLocale::c());
    m_digits->setRange(0, maximumDigits);
    m_digits->setSpecialValueText(tr("Automatic"));
    m_digits->setFixedWidth(fieldWidth);
    m_digits->setAccessibleName(tr("Significant digits"));
    form->addRow(tr("Significant digits"), m_digits);
    m_lengthUnit = createBox(tr("Length unit"));
    m_lengthUnit->addItem(tr("Automatic"), QLatin1String(automatic));
    for (const char *unit : {"nm", "um", "mm", "cm", "m"})
        m_lengthUnit->addItem(QString(QLatin1String(unit)).replace(QLatin1Char('u'), QChar(0x03bc)),
                              QLatin1String(unit));
    form->addRow(tr("Length unit"), m_lengthUnit);
    m_angleUnit = createBox(tr("Angle unit"));
    m_angleUnit->addItem(tr("Automatic"), QLatin1String(automatic));
    m_angleUnit->addItem(tr("Degrees (°)"), QStringLiteral("deg"));
    m_angleUnit->addItem(tr("Radians (rad)"), QStringLiteral("rad"));
    form->addRow(tr("Angle unit"), m_angleUnit);
}

QFormLayout *KvDeskSettingsDialog::createForm()
{
    auto *const form = new QFormLayout;
    form->setHorizontalSpacing(groupSpacing);
    form->setVerticalSpacing(rowSpacing);
    form->setLabelAlignment(Qt::AlignLeft | Qt::AlignVCenter);
    form->setFormAlignment(Qt::AlignLeft | Qt::AlignTop);
    return form;
}

void KvDeskSettingsDialog::addTitle(QFormLayout *form, const QString &title, int spaceAbove)
{
    auto *const label = new QLabel(title);
    label->setProperty("groupTitle", true);
    label->setContentsMargins(0, spaceAbove, 0, 0);
    form->addRow(label);
}

QComboBox *KvDeskSettingsDialog::createBox(const QString &name)
{
    auto *const box = new QComboBox;
    box->setFixedWidth(fieldWidth);
    box->setAccessibleName(name);
    return box;
}

void KvDeskSettingsDialog::fillLanguages()
{
    m_language->addItem(tr("System default"), KvDeskLanguages::automatic());
    for (const KvDeskLanguage &language : KvDeskLanguages::all())
        m_language->addItem(language.nativeName, language.name);
}

void KvDeskSettingsDialog::connectSignals()
{
    connect(m_buttons, SIGNAL(accepted()), this, SLOT(accept()));
    connect(m_buttons, SIGNAL(rejected()), this, SLOT(reject()));
    connect(m_buttons->button(QDialogButtonBox::Apply), SIGNAL(clicked()), this, SLOT(slotApply()));
    for (QComboBox *const box : {m_theme, m_language, m_lengthUnit, m_angleUnit})
        connect(box, SIGNAL(currentIndexChanged(int)), this, SLOT(slotValueChanged()));
    connect(m_digits, SIGNAL(valueChanged(int)), this, SLOT(slotValueChanged()));
}

void KvDeskSettingsDialog::load()
{
    choose(m_theme, acss::QtAdvancedStylesheet::getInstance()->currentTheme());
    choose(m_language, KvDeskLanguages::storedChoice());
    ZtAppSettings::beginGroup(QLatin1String(measurementGroup));
    m_digits->setValue(ZtAppSettings::value(QLatin1String(digitsKey), 0).toInt());
    choose(m_lengthUnit, ZtAppSettings::value(QLatin1String(lengthKey)));
    choose(m_angleUnit, ZtAppSettings::value(QLatin1String(angleKey)));
    ZtAppSettings::endGroup();
    m_written = values();
}

QVariantList KvDeskSettingsDialog::values() const
{
    return {m_theme->currentData(), m_language->currentData(), static_cast<uint>(m_digits->value()),
            m_lengthUnit->currentData(), m_angleUnit->currentData()};
}

void KvDeskSettingsDialog::slotValueChanged()
{
    KvDeskReason::setPossible(m_buttons->button(QDialogButtonBox::Apply), values() != m_written,
                              tr("Nothing was changed yet"));
}

void KvDeskSettingsDialog::slotApply()
{
    KvDeskLanguages::storeChoice(m_language->currentData().toString());
    ZtAppSettings::beginGroup(QLatin1String(measurementGroup));
    ZtAppSettings::setValue(QLatin1String(digitsKey), static_cast<uint>(m_digits->value()));
    ZtAppSettings::setValue(QLatin1String(lengthKey), m_lengthUnit->currentData());
    ZtAppSettings::setValue(QLatin1String(angleKey), m_angleUnit->currentData());
    ZtAppSettings::endGroup();
    const QString theme = m_theme->currentData().toString();
    KvDeskTheme::store(theme);
    if (theme != acss::QtAdvancedStylesheet::getInstance()->currentTheme())
        KvDeskTheme::apply(theme);
    m_written = values();
    slotValueChanged();
}

void KvDeskSettingsDialog::accept()
{
    slotApply();
    QDialog::accept();
}

// SPDX-License-Identifier: MIT
#include "KvDeskExportDialog.h"

#include "KvDeskReason.h"
#include "kernel/ZtAppSettings.h"

#include <QCheckBox>
#include <QComboBox>
#include <QDialogButtonBox>
#include <QFormLayout>
#include <QLabel>
#include <QPushButton>
#include <QVBoxLayout>

namespace {

constexpr int pageMargin = 24;
constexpr int groupSpacing = 16;
constexpr int rowSpacing = 8;
constexpr int fieldWidth = 320; ///< at least
constexpr int noteLines = 2;

const char groupName[] = "DeskExport";
const char layoutKey[] = "Layout";
const char spreadsheetKey[] = "SpreadsheetNumbers";
const char markKey[] = "ByteOrderMark";
const char guardKey[] = "GuardFormulas";
const char selectionKey[] = "SelectionOnly";

bool storedFlag(const char *key)
{
    return ZtAppSettings::value(QLatin1String(key), false).toBool();
}

} // namespace

KvDeskExportDialog::KvDeskExportDialog(const QVector<ZtTableExport::ObjectId> &selection, QWidget *parent)
    : QDialog(parent)
    , m_selection(selection)
{
    setWindowTitle(tr("Export measured values"));
    createFields();
    auto *const layout = new QVBoxLayout(this);
    layout->setContentsMargins(pageMargin, pageMargin, pageMargin, pageMargin);
    layout->setSpacing(groupSpacing);
    layout->addLayout(createForm());
    layout->addWidget(m_buttons);
    layout->setSizeConstraint(QLayout::SetFixedSize);
    load();
    connect(m_layout, SIGNAL(currentIndexChanged(int)), this, SLOT(slotUpdate()));
    connect(m_buttons, SIGNAL(accepted()), this, SLOT(accept()));
    connect(m_buttons, SIGNAL(rejected()), this, SLOT(reject()));
    slotUpdate();
}

void KvDeskExportDialog::createFields()
{
    m_layout = new QComboBox;
    m_layout->setAccessibleName(tr("Table"));
    fillLayouts();
    m_note = new QLabel;
    m_note->setProperty("caption", true);
    m_note->setWordWrap(true);
    m_note->setMinimumHeight(noteLines * m_note->fontMetrics().lineSpacing());
    m_note->setAlignment(Qt::AlignLeft | Qt::AlignTop);
    m_numbers = new QComboBox;
    m_numbers->setAccessibleName(tr("Numbers"));
    fillNumbers();
    for (QWidget *const field : {static_cast<QWidget *>(m_layout), static_cast<QWidget *>(m_note),
                                 static_cast<QWidget *>(m_numbers)})
        field->setMinimumWidth(fieldWidth);
    m_selectionOnly = new QCheckBox(tr("Only the selected object(s) (%n)", "", m_selection.size()));
    m_mark = new QCheckBox(tr("Byte order mark, for spreadsheets that do not expect UTF-8"));
    m_guard = new QCheckBox(tr("Apostrophe before names that spreadsheets take for formulas"));
    m_guard->setToolTip(tr("Changes names that begin with =, +, - or @: they are others when the table is "
                           "imported again"));
    m_buttons = new QDialogButtonBox(QDialogButtonBox::Save | QDialogButtonBox::Cancel);
    m_buttons->button(QDialogButtonBox::Save)->setText(tr("Export..."));
    m_buttons->button(QDialogButtonBox::Save)->setDefault(true);
}

void KvDeskExportDialog::fillLayouts()
{
    m_layout->addItem(tr("CSV, one row per value"), ZtTableExport::TidyCsv);
    m_layout->addItem(tr("CSV, one row per object"), ZtTableExport::WideCsv);
    m_layout->addItem(tr("JSON"), ZtTableExport::Json);
}

void KvDeskExportDialog::fillNumbers()
{
    m_numbers->addItem(tr("1.5, commas between the fields"), false);
    const QLocale locale;
    const bool hasComma = locale.decimalPoint() == QLatin1Char(',');
    //: %1 is the name of a language
    const QString system = hasComma ? tr("1,5, semicolons between the fields (spreadsheets, %1)")
                                    : tr("1.5, commas between the fields (spreadsheets, %1)");
    const QString language = locale.nativeLanguageName();
    m_numbers->addItem(system.arg(language.isEmpty() ? locale.name() : language), true);
}

QFormLayout *KvDeskExportDialog::createForm()
{
    auto *const form = new QFormLayout;
    form->setHorizontalSpacing(groupSpacing);
    form->setVerticalSpacing(rowSpacing);
    form->setLabelAlignment(Qt::AlignLeft | Qt::AlignVCenter);
    form->addRow(tr("Table"), m_layout);
    form->addRow(QString(), m_note);
    form->addRow(tr("Numbers"), m_numbers);
    form->addRow(QString(), m_selectionOnly);
    form->addRow(QString(), m_mark);
    form->addRow(QString(), m_guard);
    return form;
}

ZtTableExport::Layout KvDeskExportDialog::chosenLayout() const
{
    return static_cast<ZtTableExport::Layout>(m_layout->currentData().toInt());
}

void KvDeskExportDialog::slotUpdate()
{
    const bool isCsv = chosenLayout() != ZtTableExport::Json;
    const QList<QWidget *> choices{m_numbers, m_mark, m_guard};
    for (QWidget *const choice : choices)
        KvDeskReason::setPossible(choice, isCsv, tr("Concerns CSV tables only"));
    const QString notes[] = {tr("For statistics programs. Can be imported here again."),
                             tr("For spreadsheets. Headings name the units."),
                             tr("For programs. Numbers always have a decimal point.")};
    m_note->setText(notes[chosenLayout()]);
    KvDeskReason::setPossible(m_selectionOnly, !m_selection.isEmpty(), tr("No measured object is selected"));
}

ZtTableExport::Options KvDeskExportDialog::options() const
{
    ZtTableExport::Options options;
    options.layout = chosenLayout();
    if (m_numbers->currentData().toBool())
        options.locale = QLocale();
    options.hasByteOrderMark = m_mark->isChecked();
    options.guardsFormulas = m_guard->isChecked();
    options.isSelectionOnly = m_selectionOnly->isEnabled() && m_selectionOnly->isChecked();
    options.selection = m_selection;
    return options;
}

void KvDeskExportDialog::load()
{
    ZtAppSettings::beginGroupAbsolute(QLatin1String(groupName));
    m_layout->setCurrentIndex(qMax(0, m_layout->findData(ZtAppSettings::value(QLatin1String(layoutKey), 0))));
    m_numbers->setCurrentIndex(storedFlag(spreadsheetKey) ? 1 : 0);
    m_mark->setChecked(storedFlag(markKey));
    m_guard->setChecked(storedFlag(guardKey));
    m_selectionOnly->setChecked(storedFlag(selectionKey));
    ZtAppSettings::endGroup();
}

void KvDeskExportDialog::store() const
{
    ZtAppSettings::beginGroupAbsolute(QLatin1String(groupName));
    ZtAppSettings::setValue(QLatin1String(layoutKey), m_layout->currentData());
    ZtAppSettings::setValue(QLatin1String(spreadsheetKey), m_numbers->currentData());
    ZtAppSettings::setValue(QLatin1String(markKey), m_mark->isChecked());
    ZtAppSettings::setValue(QLatin1String(guardKey), m_guard->isChecked());
    // Without a selection, nobody chose anything.
    if (!m_selection.isEmpty())
        ZtAppSettings::setValue(QLatin1String(selectionKey), m_selectionOnly->isChecked());
    ZtAppSettings::endGroup();
}

void KvDeskExportDialog::accept()
{
    store();
    QDialog::accept();
}

// SPDX-License-Identifier: MIT
#include "KvDeskCalibrationDialog.h"

#include "KvDeskCalibrationHistory.h"
#include "KvDeskCalibrationText.h"
#include "KvDeskCalibrator.h"
#include "KvDeskFilePixelSize.h"
#include "KvDeskKnownDistance.h"
#include "KvDeskTableView.h"
#include "KvDeskTypedPixelSize.h"

#include <QButtonGroup>
#include <QComboBox>
#include <QFormLayout>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QRadioButton>
#include <QSignalBlocker>
#include <QStackedWidget>
#include <QVBoxLayout>

namespace {

constexpr int pageMargin = 24;
constexpr int groupSpacing = 16;
constexpr int rowSpacing = 8;
constexpr int objectiveWidth = 200;
constexpr int historyHeight = 144;
constexpr int smallestWidth = 600;

} // namespace

KvDeskCalibrationDialog::KvDeskCalibrationDialog(KvDeskCalibrator *calibrator, QWidget *parent)
    : QDialog(parent)
    , m_calibrator(calibrator)
{
    setWindowTitle(tr("Calibration"));
    auto *const layout = new QVBoxLayout(this);
    // Not a minimum width of the window, which would hold for longer texts, too.
    layout->addStrut(smallestWidth - 2 * pageMargin);
    layout->setContentsMargins(pageMargin, pageMargin, pageMargin, pageMargin);
    layout->setSpacing(rowSpacing);
    addObjective(layout);
    addWays(layout);
    addDescription(layout);
    addHistory(layout);
    alignLabels();

    const ZtCalibration current = calibrator->current();
    const QString first = current.isCalibrated() ? current.objective() : calibrator->store()->lastObjective();
    fillObjectives();
    m_objective->setEditText(first);
    m_author->setText(calibrator->store()->author());
    m_typed->setPixelSize(current);
    setWay(KnownDistance);
    connectSignals();
    slotRefresh();
    m_objective->setFocus();
}

void KvDeskCalibrationDialog::addTitle(QVBoxLayout *layout, const QString &title)
{
    auto *const label = new QLabel(title, this);
    label->setProperty("groupTitle", true);
    layout->addSpacing(groupSpacing - rowSpacing);
    layout->addWidget(label);
}

QFormLayout *KvDeskCalibrationDialog::createForm()
{
    auto *const form = new QFormLayout;
    form->setHorizontalSpacing(groupSpacing);
    form->setVerticalSpacing(rowSpacing);
    form->setLabelAlignment(Qt::AlignLeft | Qt::AlignVCenter);
    return form;
}

void KvDeskCalibrationDialog::addRow(QFormLayout *form, const QString &name, QWidget *field)
{
    auto *const label = new QLabel(name, this);
    m_labels.append(label);
    form->addRow(label, field);
}

// The fields of both forms begin below one another.
void KvDeskCalibrationDialog::alignLabels()
{
    int width = 0;
    for (const QLabel *const label : qAsConst(m_labels))
        width = qMax(width, label->sizeHint().width());
    for (QLabel *const label : qAsConst(m_labels))
        label->setMinimumWidth(width);
}

void KvDeskCalibrationDialog::addObjective(QVBoxLayout *layout)
{
    m_objective = new QComboBox(this);
    m_objective->setEditable(true);
    m_objective->setInsertPolicy(QComboBox::NoInsert);
    m_objective->setFixedWidth(objectiveWidth);
    m_objective->setAccessibleName(tr("Objective"));
    m_objective->setToolTip(tr("Choose an objective, or type the name of a new one"));
    m_objective->lineEdit()->setPlaceholderText(tr("Such as 10x"));
    m_current = new QLabel(this);
    m_current->setTextFormat(Qt::PlainText);
    m_current->setWordWrap(true);
    QFormLayout *const form = createForm();
    addRow(form, tr("Objective"), m_objective);
    addRow(form, tr("In use"), m_current);
    layout->addLayout(form);
}

void KvDeskCalibrationDialog::addWays(QVBoxLayout *layout)
{
    addTitle(layout, tr("New calibration"));
    m_ways = new QButtonGroup(this);
    auto *const row = new QHBoxLayout;
    row->setSpacing(groupSpacing);
    const QStringList names{tr("Known distance"), tr("Image file"), tr("Typed")};
    for (int i = 0; i < WayCount; ++i) {
        auto *const button = new QRadioButton(names.at(i), this);
        m_ways->addButton(button, i);
        row->addWidget(button);
    }
    row->addStretch();
    layout->addLayout(row);

    m_knownDistance = new KvDeskKnownDistance(m_calibrator, this);
    m_imageFile = new KvDeskFilePixelSize(m_calibrator, this);
    m_typed = new KvDeskTypedPixelSize(this);
    m_pages = new QStackedWidget(this);
    for (KvDeskCalibrationWay *const page :
         std::initializer_list<KvDeskCalibrationWay *>{m_knownDistance, m_imageFile, m_typed})
        m_pages->addWidget(page);
    layout->addWidget(m_pages);
}

QLineEdit *KvDeskCalibrationDialog::createField(QFormLayout *form, const QString &name)
{
    auto *const field = new QLineEdit(this);
    field->setAccessibleName(name);
    addRow(form, name, field);
    return field;
}

void KvDeskCalibrationDialog::addDescription(QVBoxLayout *layout)
{
    layout->addSpacing(groupSpacing - rowSpacing);
    QFormLayout *const form = createForm();
    m_name = createField(form, tr("Name"));
    m_author = createField(form, tr("Who"));
    m_note = createField(form, tr("Note"));
    layout->addLayout(form);
    m_result = new QLabel(this);
    m_result->setWordWrap(true);
    m_calibrate = new QPushButton(tr("Calibrate"), this);
    m_calibrate->setDefault(true);
    auto *const row = new QHBoxLayout;
    row->setSpacing(rowSpacing);
    row->addWidget(m_result, 1);
    row->addWidget(m_calibrate);
    layout->addLayout(row);
}

void KvDeskCalibrationDialog::addHistory(QVBoxLayout *layout)
{
    addTitle(layout, tr("History of the objective"));
    m_history = new KvDeskCalibrationHistory(this);
    m_historyView = new KvDeskTableView(this);
    m_historyView->setModel(m_history);
    m_historyView->setSelectionMode(QAbstractItemView::SingleSelection);
    m_historyView->setAccessibleName(tr("History of the objective"));
    m_historyView->setMinimumHeight(historyHeight);
    m_historyView->horizontalHeader()->setStretchLastSection(true);
    m_noHistory = new QLabel(tr("Calibrations of this objective appear here"), m_historyView->viewport());
    m_noHistory->setProperty("emptyState", true);
    m_noHistory->setAlignment(Qt::AlignCenter);
    auto *const overlay = new QVBoxLayout(m_historyView->viewport());
    overlay->addWidget(m_noHistory);
    m_useAgain = new QPushButton(tr("Use again"), this);
    m_useAgain->setAutoDefault(false);
    m_close = new QPushButton(tr("Close"), this);
    m_close->setAutoDefault(false);
    auto *const row = new QHBoxLayout;
    row->setSpacing(rowSpacing);
    row->addWidget(m_useAgain);
    row->addStretch();
    row->addWidget(m_close);
    layout->addWidget(m_historyView, 1);
    layout->addLayout(row);
}

void KvDeskCalibrationDialog::connectSignals()
{
    connect(m_calibrator, SIGNAL(signalChanged()), this, SLOT(slotRefresh()));
    connect(m_objective, SIGNAL(editTextChanged(QString)), this, SLOT(slotObjectiveChanged()));
    connect(m_ways, SIGNAL(idClicked(int)), this, SLOT(slotWayChanged()));
    for (int i = 0; i < WayCount; ++i)
        connect(m_pages->widget(i), SIGNAL(signalChanged()), this, SLOT(slotResultChanged()));
    connect(m_calibrate, SIGNAL(clicked()), this, SLOT(slotCalibrate()));
    connect(m_historyView->selectionModel(), SIGNAL(selectionChanged(QItemSelection,QItemSelection)), this,
                                                    SLOT(slotSelectionChanged()));
    connect(m_historyView, SIGNAL(doubleClicked(QModelIndex)), this, SLOT(slotUseAgain()));
    connect(m_useAgain, SIGNAL(clicked()), this, SLOT(slotUseAgain()));
    connect(m_close, SIGNAL(clicked()), this, SLOT(close()));
}

QString KvDeskCalibrationDialog::objective() const
{
    return m_objective->currentText().trimmed();
}

KvDeskCalibrationDialog::Way KvDeskCalibrationDialog::way() const
{
    return static_cast<Way>(m_ways->checkedId());
}

void KvDeskCalibrationDialog::setWay(Way way)
{
    m_ways->button(way)->setChecked(true);
    slotWayChanged();
}

QAbstractButton *KvDeskCalibrationDialog::wayButton(Way way) const
{
    return m_ways->button(way);
}

KvDeskCalibrationWay *KvDeskCalibrationDialog::page() const
{
    return static_cast<KvDeskCalibrationWay *>(m_pages->currentWidget());
}

QString KvDeskCalibrationDialog::currentText() const
{
    return m_current->text();
}

QString KvDeskCalibrationDialog::resultText() const
{
    return m_result->text();
}

// The text that is being typed stays.
void KvDeskCalibrationDialog::fillObjectives()
{
    const QStringList objectives = m_calibrator->store()->objectives();
    QStringList shown;
    for (int i = 0; i < m_objective->count(); ++i)
        shown.append(m_objective->itemText(i));
    if (objectives == shown)
        return;
    const QSignalBlocker blocker(m_objective);
    const QString text = m_objective->currentText();
    m_objective->clear();
    m_objective->addItems(objectives);
    m_objective->setCurrentIndex(m_objective->findText(text, Qt::MatchFixedString | Qt::MatchCaseSensitive));
    m_objective->setEditText(text);
}

void KvDeskCalibrationDialog::slotRefresh()
{
    m_current->setText(KvDeskCalibrationText::summary(m_calibrator->current()));
    fillObjectives();
    m_knownDistance->refresh();
    m_imageFile->refresh();
    showHistory();
    slotResultChanged();
}

void KvDeskCalibrationDialog::slotObjectiveChanged()
{
    showHistory();
}

void KvDeskCalibrationDialog::showHistory()
{
    m_history->setHistory(m_calibrator->store()->history(objective()));
    const bool isEmpty = m_history->rowCount() == 0;
    m_noHistory->setVisible(isEmpty);
    m_historyView->horizontalHeader()->setVisible(!isEmpty);
    if (!isEmpty && !m_historyView->selectionModel()->hasSelection())
        m_historyView->selectRow(0);
    // The last one takes what is left; all at once would take that from it.
    for (int column = 0; column + 1 < m_history->columnCount(); ++column)
        m_historyView->resizeColumnToContents(column);
    slotSelectionChanged();
}

void KvDeskCalibrationDialog::slotWayChanged()
{
    m_pages->setCurrentIndex(way());
    slotResultChanged();
}

void KvDeskCalibrationDialog::slotResultChanged()
{
    const ZtCalibration result = page()->calibration();
    const QString fault = page()->fault();
    m_calibrate->setEnabled(result.isCalibrated());
    if (result.isCalibrated()) {
        m_result->setText(tr("New pixel size: %1").arg(KvDeskCalibrationText::pixelSize(result)));
        m_calibrate->setToolTip(tr("Measure with this pixel size and remember it"));
    } else {
        m_result->setText(fault.isEmpty() ? tr("No pixel size yet") : fault);
        m_calibrate->setToolTip(fault.isEmpty() ? tr("Complete the fields above first") : fault);
    }
}

void KvDeskCalibrationDialog::slotSelectionChanged()
{
    m_useAgain->setEnabled(m_historyView->selectionModel()->hasSelection());
    m_useAgain->setToolTip(m_useAgain->isEnabled() ? tr("Measure with the selected calibration")
                                                   : tr("Select a calibration in the table first"));
}

void KvDeskCalibrationDialog::slotCalibrate()
{
    ZtCalibration calibration = page()->calibration();
    calibration.setObjective(objective());
    const QString name = m_name->text().trimmed();
    if (!name.isEmpty())
        calibration.setName(name);
    calibration.setAuthor(m_author->text().trimmed());
    calibration.setNote(m_note->text().trimmed());
    m_calibrator->calibrate(calibration);
    m_historyView->selectRow(0);
}

void KvDeskCalibrationDialog::slotUseAgain()
{
    const QModelIndexList rows = m_historyView->selectionModel()->selectedRows();
    if (rows.isEmpty())
        return;
    m_calibrator->useAgain(m_history->calibration(rows.first().row()), m_author->text().trimmed());
    m_historyView->selectRow(0);
}

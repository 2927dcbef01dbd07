// SPDX-License-Identifier: MIT
#include "KvDeskExportDialog.h"

#include "kernel/ZtAppSettings.h"
#include "support/StatReportTest.h"

#include <QCheckBox>
#include <QComboBox>
#include <QDialogButtonBox>

namespace {

const QVector<ZtTableExport::ObjectId> twoObjects{{1, 1}, {1, 2}};

} // namespace

class KvDeskExportDialogTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void texts();
    void defaults();
    void choices();
    void jsonHasNoNumbersToChoose();
    void selectionNeedsObjects();
    void choicesAreRemembered();
    void cancelledChoicesAreForgotten();
    void keepsItsSize();

private:
    QLocale m_locale;
};

void KvDeskExportDialogTest::init()
{
    StatReportTest::init();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    m_locale = QLocale();
    QLocale::setDefault(QLocale(QLocale::German, QLocale::Germany));
}

void KvDeskExportDialogTest::cleanup()
{
    QLocale::setDefault(m_locale);
    ZtAppSettings::getInstance()->setStoragePath(QString());
    StatReportTest::cleanup();
}

void KvDeskExportDialogTest::texts()
{
    const KvDeskExportDialog dialog(twoObjects);
    QCOMPARE(dialog.windowTitle(), QStringLiteral("Export measured values"));
    QStringList layouts;
    for (int i = 0; i < dialog.layoutBox()->count(); ++i)
        layouts.append(dialog.layoutBox()->itemText(i));
    QCOMPARE(layouts, QStringList({QStringLiteral("CSV, one row per value"),
                                   QStringLiteral("CSV, one row per object"), QStringLiteral("JSON")}));
    QCOMPARE(dialog.numbersBox()->itemText(0), QStringLiteral("1.5, commas between the fields"));
    QCOMPARE(dialog.numbersBox()->itemText(1),
             QStringLiteral("1,5, semicolons between the fields (spreadsheets, Deutsch)"));
    QCOMPARE(dialog.selectionBox()->text(), QStringLiteral("Only the selected object(s) (2)"));
    QVERIFY(!dialog.guardBox()->toolTip().isEmpty());
}

void KvDeskExportDialogTest::defaults()
{
    const ZtTableExport::Options options = KvDeskExportDialog(twoObjects).options();
    QCOMPARE(options.layout, ZtTableExport::TidyCsv);
    QCOMPARE(options.locale, QLocale::c());
    QVERIFY(!options.hasByteOrderMark);
    QVERIFY(!options.guardsFormulas);
    QVERIFY(!options.isSelectionOnly);
    QCOMPARE(options.selection, twoObjects);
}

void KvDeskExportDialogTest::choices()
{
    const KvDeskExportDialog dialog(twoObjects);
    dialog.layoutBox()->setCurrentIndex(1);
    dialog.numbersBox()->setCurrentIndex(1);
    dialog.markBox()->setChecked(true);
    dialog.guardBox()->setChecked(true);
    dialog.selectionBox()->setChecked(true);
    const ZtTableExport::Options options = dialog.options();
    QCOMPARE(options.layout, ZtTableExport::WideCsv);
    QCOMPARE(options.locale, QLocale(QLocale::German, QLocale::Germany));
    QVERIFY(options.hasByteOrderMark);
    QVERIFY(options.guardsFormulas);
    QVERIFY(options.isSelectionOnly);
}

void KvDeskExportDialogTest::jsonHasNoNumbersToChoose()
{
    const KvDeskExportDialog dialog(twoObjects);
    QVERIFY(dialog.numbersBox()->isEnabled());
    dialog.layoutBox()->setCurrentIndex(2);
    QVERIFY(!dialog.numbersBox()->isEnabled());
    QVERIFY(!dialog.markBox()->isEnabled());
    QVERIFY(!dialog.guardBox()->isEnabled());
    QVERIFY(dialog.selectionBox()->isEnabled());
}

void KvDeskExportDialogTest::selectionNeedsObjects()
{
    const KvDeskExportDialog dialog({});
    QVERIFY(!dialog.selectionBox()->isEnabled());
    QCOMPARE(dialog.selectionBox()->toolTip(), QStringLiteral("No measured object is selected"));
    dialog.selectionBox()->setChecked(true);
    QVERIFY(!dialog.options().isSelectionOnly);
}

void KvDeskExportDialogTest::choicesAreRemembered()
{
    {
        KvDeskExportDialog dialog(twoObjects);
        dialog.layoutBox()->setCurrentIndex(2);
        dialog.numbersBox()->setCurrentIndex(1);
        dialog.markBox()->setChecked(true);
        dialog.guardBox()->setChecked(true);
        dialog.selectionBox()->setChecked(true);
        dialog.accept();
    }
    {
        // Says nothing about a selection, as there is none.
        KvDeskExportDialog dialog({});
        dialog.accept();
    }
    const KvDeskExportDialog dialog(twoObjects);
    QCOMPARE(dialog.layoutBox()->currentIndex(), 2);
    QCOMPARE(dialog.numbersBox()->currentIndex(), 1);
    QVERIFY(dialog.markBox()->isChecked());
    QVERIFY(dialog.guardBox()->isChecked());
    QVERIFY(dialog.selectionBox()->isChecked());
}

void KvDeskExportDialogTest::cancelledChoicesAreForgotten()
{
    {
        KvDeskExportDialog dialog(twoObjects);
        dialog.layoutBox()->setCurrentIndex(2);
        dialog.reject();
    }
    QCOMPARE(KvDeskExportDialog(twoObjects).layoutBox()->currentIndex(), 0);
}

void KvDeskExportDialogTest::keepsItsSize()
{
    KvDeskExportDialog dialog(twoObjects);
    dialog.show();
    QVERIFY(QTest::qWaitForWindowExposed(&dialog));
    const QSize size = dialog.size();
    for (int i = 0; i < dialog.layoutBox()->count(); ++i) {
        dialog.layoutBox()->setCurrentIndex(i);
        QCoreApplication::processEvents();
        QCOMPARE(dialog.size(), size);
    }
}

STATREPORT_TEST_MAIN(KvDeskExportDialogTest)
#include "KvDeskExportDialogTest.moc"

// SPDX-License-Identifier: MIT
#include "KvDeskSettingsDialog.h"

#include "KvDeskLanguages.h"
#include "gui/QtAdvancedStylesheet.h"
#include "kernel/ZtAppSettings.h"
#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtSignalCenter.h"
#include "measuring/ZtUnitSettings.h"
#include "support/StatReportTest.h"

namespace {

// All keys of the settings file with their values, as "group/key=value".
QStringList storedValues(const QString &path)
{
    const QSettings settings(path, QSettings::IniFormat);
    QStringList values;
    for (const QString &key : settings.allKeys())
        values.append(key + QLatin1Char('=') + settings.value(key).toString());
    return values;
}

void choose(QComboBox *box, const char *data)
{
    box->setCurrentIndex(box->findData(QLatin1String(data)));
}

} // namespace

class KvDeskSettingsDialogTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void defaults();
    void writesExactlyItsKeys();
    void showsWhatIsStored();
    void unknownValuesStandForTheDefault();
    void cancelWritesNothing();
    void applyIsOfferedForChanges();
    void applyWritesAndStaysOpen();
    void changedUnitsAreAnnounced();
    void themeChangesAtOnce();
    void languagesHaveTheirOwnNames();
    void fieldsAreAligned();

private:
    QString m_path;
};

void KvDeskSettingsDialogTest::init()
{
    StatReportTest::init();
    m_path = temporaryPath(QString::fromLatin1(QTest::currentTestFunction()) + QStringLiteral(".ini"));
    ZtAppSettings::getInstance()->setStoragePath(m_path);
}

void KvDeskSettingsDialogTest::cleanup()
{
    ZtAppSettings::getInstance()->setStoragePath(QString());
    acss::QtAdvancedStylesheet::getInstance()->setCurrentTheme(QStringLiteral("Dark"));
    StatReportTest::cleanup();
}

void KvDeskSettingsDialogTest::defaults()
{
    const KvDeskSettingsDialog dialog;
    QCOMPARE(dialog.windowTitle(), QStringLiteral("Settings"));
    QCOMPARE(dialog.themeBox()->currentData().toString(), QStringLiteral("Dark"));
    QCOMPARE(dialog.languageBox()->currentData().toString(), QStringLiteral("auto"));
    QCOMPARE(dialog.languageBox()->currentText(), QStringLiteral("System default"));
    QCOMPARE(dialog.digitsBox()->value(), 0);
    QCOMPARE(dialog.digitsBox()->text(), QStringLiteral("Automatic"));
    QCOMPARE(dialog.lengthUnitBox()->currentData().toString(), QStringLiteral("auto"));
    QCOMPARE(dialog.angleUnitBox()->currentData().toString(), QStringLiteral("auto"));
}

void KvDeskSettingsDialogTest::writesExactlyItsKeys()
{
    KvDeskSettingsDialog dialog;
    choose(dialog.themeBox(), "Light");
    choose(dialog.languageBox(), "ChineseTraditional");
    dialog.digitsBox()->setValue(4);
    choose(dialog.lengthUnitBox(), "um");
    choose(dialog.angleUnitBox(), "rad");
    QSignalSpy modified(ZtAppSettings::getInstance(),
                        SIGNAL(signalValuesModified(QStringList,QList<QVariant>)));
    dialog.accept();
    QCOMPARE(dialog.result(), static_cast<int>(QDialog::Accepted));
    QVERIFY(ZtAppSettings::getInstance()->sync());
    QCOMPARE(storedValues(m_path),
             QStringList({QStringLiteral("DefaultProfile/Desk/Theme=Light"),
                          QStringLiteral("DefaultProfile/GEN_Language=ChineseTraditional"),
                          QStringLiteral("DefaultProfile/Measurement/AngleUnit=rad"),
                          QStringLiteral("DefaultProfile/Measurement/LengthUnit=um"),
                          QStringLiteral("DefaultProfile/Measurement/MeasurementLabelsSignDigits=4")}));
    QStringList announced;
    for (const QList<QVariant> &arguments : modified)
        announced += arguments.first().toStringList();
    announced.sort();
    QCOMPARE(announced,
             QStringList({QStringLiteral("AngleUnit"), QStringLiteral("GEN_Language"),
                          QStringLiteral("LengthUnit"), QStringLiteral("MeasurementLabelsSignDigits"),
                          QStringLiteral("Theme")}));
}

void KvDeskSettingsDialogTest::showsWhatIsStored()
{
    KvDeskLanguages::storeChoice(QStringLiteral("Slovakian"));
    ZtAppSettings::beginGroup(QStringLiteral("Measurement"));
    ZtAppSettings::setValue(QStringLiteral("MeasurementLabelsSignDigits"), 7U);
    ZtAppSettings::setValue(QStringLiteral("LengthUnit"), QStringLiteral("mm"));
    ZtAppSettings::setValue(QStringLiteral("AngleUnit"), QStringLiteral("deg"));
    ZtAppSettings::endGroup();
    const KvDeskSettingsDialog dialog;
    QCOMPARE(dialog.languageBox()->currentText(), QStringLiteral("Slovenčina"));
    QCOMPARE(dialog.digitsBox()->value(), 7);
    QCOMPARE(dialog.lengthUnitBox()->currentText(), QStringLiteral("mm"));
    QCOMPARE(dialog.angleUnitBox()->currentData().toString(), QStringLiteral("deg"));
}

void KvDeskSettingsDialogTest::unknownValuesStandForTheDefault()
{
    KvDeskLanguages::storeChoice(QStringLiteral("Klingon"));
    ZtAppSettings::beginGroup(QStringLiteral("Measurement"));
    ZtAppSettings::setValue(QStringLiteral("MeasurementLabelsSignDigits"), QStringLiteral("many"));
    ZtAppSettings::setValue(QStringLiteral("LengthUnit"), QStringLiteral("ell"));
    ZtAppSettings::endGroup();
    const KvDeskSettingsDialog dialog;
    QCOMPARE(dialog.languageBox()->currentData().toString(), QStringLiteral("auto"));
    QCOMPARE(dialog.digitsBox()->value(), 0);
    QCOMPARE(dialog.lengthUnitBox()->currentData().toString(), QStringLiteral("auto"));
}

void KvDeskSettingsDialogTest::cancelWritesNothing()
{
    KvDeskSettingsDialog dialog;
    dialog.digitsBox()->setValue(4);
    dialog.buttonBox()->button(QDialogButtonBox::Cancel)->click();
    QCOMPARE(dialog.result(), static_cast<int>(QDialog::Rejected));
    QVERIFY(ZtAppSettings::getInstance()->sync());
    QCOMPARE(storedValues(m_path), QStringList());
}

void KvDeskSettingsDialogTest::applyIsOfferedForChanges()
{
    const KvDeskSettingsDialog dialog;
    const QPushButton *const apply = dialog.buttonBox()->button(QDialogButtonBox::Apply);
    QVERIFY(!apply->isEnabled());
    dialog.digitsBox()->setValue(4);
    QVERIFY(apply->isEnabled());
    dialog.digitsBox()->setValue(0);
    QVERIFY(!apply->isEnabled());
}

void KvDeskSettingsDialogTest::applyWritesAndStaysOpen()
{
    KvDeskSettingsDialog dialog;
    dialog.show();
    dialog.digitsBox()->setValue(4);
    QPushButton *const apply = dialog.buttonBox()->button(QDialogButtonBox::Apply);
    apply->click();
    QVERIFY(dialog.isVisible());
    QVERIFY(!apply->isEnabled());
    QCOMPARE(ZtUnitSettings::getInstance()->significantDigits(), 4);
}

void KvDeskSettingsDialogTest::changedUnitsAreAnnounced()
{
    ZtUnitSettings::getInstance()->reload();
    QSignalSpy length(ZtSignalCenter::getInstance(), SIGNAL(signalLengthUnitChanged()));
    QSignalSpy angle(ZtSignalCenter::getInstance(), SIGNAL(signalAngleUnitChanged()));
    KvDeskSettingsDialog dialog;
    choose(dialog.lengthUnitBox(), "cm");
    dialog.slotApply();
    QCOMPARE(length.count(), 1);
    QCOMPARE(angle.count(), 0);
    QCOMPARE(ZtUnitSettings::getInstance()->chosenUnit(ZtGsManipulator::Length).text(), QStringLiteral("cm"));
}

void KvDeskSettingsDialogTest::themeChangesAtOnce()
{
    KvDeskSettingsDialog dialog;
    choose(dialog.themeBox(), "Light");
    dialog.slotApply();
    QCOMPARE(acss::QtAdvancedStylesheet::getInstance()->currentTheme(), QStringLiteral("Light"));
}

void KvDeskSettingsDialogTest::languagesHaveTheirOwnNames()
{
    const KvDeskSettingsDialog dialog;
    QStringList names;
    for (int i = 0; i < dialog.languageBox()->count(); ++i)
        names.append(dialog.languageBox()->itemText(i));
    QCOMPARE(names.size(), 13);
    for (const char *name : {"English", "Deutsch", "Français", "Español", "Italiano", "Русский", "日本語",
                             "한국어", "العربية", "简体中文", "繁體中文", "Slovenčina"})
        QVERIFY2(names.contains(QString::fromUtf8(name)), name);
    QStringList texts;
    for (const QLabel *const label : dialog.findChildren<QLabel *>())
        texts.append(label->text());
    QVERIFY(
        texts.contains(QStringLiteral("Another language takes effect when the program is started again.")));
}

void KvDeskSettingsDialogTest::fieldsAreAligned()
{
    KvDeskSettingsDialog dialog;
    dialog.show();
    const QList<QWidget *> fields{dialog.themeBox(), dialog.languageBox(), dialog.digitsBox(),
                                  dialog.lengthUnitBox(), dialog.angleUnitBox()};
    for (const QWidget *const field : fields) {
        QCOMPARE(field->x(), fields.first()->x());
        QCOMPARE(field->width(), fields.first()->width());
        QVERIFY(!field->accessibleName().isEmpty());
    }
}

STATREPORT_TEST_MAIN(KvDeskSettingsDialogTest)
#include "KvDeskSettingsDialogTest.moc"

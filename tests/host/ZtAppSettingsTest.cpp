// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "common/ZtAppStatus.h"
#include "kernel/ZtAppSettings.h"

#include <QCoreApplication>
#include <QFile>
#include <QLocale>
#include <QProcess>
#include <QSize>

namespace {

const char *const leaveArgument = "--write-and-leave";

/// What a program does that never enters an event loop: the settings are written when its application object
/// dies.
int writeAndLeave(int argc, char **argv)
{
    const QCoreApplication application(argc, argv);
    ZtAppSettings::beginGroup(QStringLiteral("Child"));
    ZtAppSettings::setValue(QStringLiteral("greeting"), QStringLiteral("bye"));
    ZtAppSettings::endGroup();
    return 0;
}

bool writeFile(const QString &path, const QByteArray &text)
{
    QFile file(path);
    return file.open(QIODevice::WriteOnly) && file.write(text) == text.size();
}

QByteArray readFile(const QString &path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}

QVariant valueIn(const QString &group, const QString &key)
{
    ZtAppSettings::beginGroup(group);
    const QVariant value = ZtAppSettings::value(key);
    ZtAppSettings::endGroup();
    return value;
}

void setValueIn(const QString &group, const QString &key, const QVariant &value)
{
    ZtAppSettings::beginGroup(group);
    ZtAppSettings::setValue(key, value);
    ZtAppSettings::endGroup();
}

QVariant absoluteValueIn(const QString &group, const QString &key)
{
    ZtAppSettings::beginGroupAbsolute(group);
    const QVariant value = ZtAppSettings::value(key);
    ZtAppSettings::endGroup();
    return value;
}

/// Reads and writes settings out of their announcement, as the program's parts do.
class BusyReceiver : public QObject
{
    Q_OBJECT
public:
    BusyReceiver()
    {
        connect(ZtAppSettings::getInstance(), SIGNAL(signalValuesModified(QStringList,QList<QVariant>)), this,
                                                     SLOT(slotValuesModified(QStringList,QList<QVariant>)));
    }

    QStringList seen;

private slots:
    void slotValuesModified(const QStringList &keys, const QList<QVariant> &values)
    {
        Q_UNUSED(values)
        seen.append(keys.join(QLatin1Char('+')));
        setValueIn(QStringLiteral("Mirror"), QStringLiteral("last"),
                   valueIn(QStringLiteral("G"), QStringLiteral("k")));
    }
};

} // namespace

class ZtAppSettingsTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void aMissingValueHasItsDefault();
    void groupsNest();
    void absoluteGroupsIgnoreWhatIsOpen();
    void withoutAGroupKeysBelongToTheProfile();
    void superfluousSlashesDoNotMatter_data();
    void superfluousSlashesDoNotMatter();
    void anEmptyKeyIsRefused();
    void endingNoGroupIsHarmless();
    void listsTheKeysOfTheOpenGroup();
    void removingTakesWhatIsBelow();
    void removingTheOpenGroup();
    void anInvalidValueRemoves();

    void changesAreAnnouncedAtOnceWithoutAGroup();
    void changesAreAnnouncedOnceAtTheLastClose();
    void onlyRealChangesAreAnnounced_data();
    void onlyRealChangesAreAnnounced();
    void aChangeTakenBackIsNoChange();
    void theLastOfSeveralChangesCounts();
    void removalsAreAnnounced();
    void receiversMayUseTheSettings();

    void profilesKeepTheirOwnValues();
    void absoluteGroupsAreSharedByProfiles();
    void profilesAreListed();
    void profileChangesAreAnnounced();
    void openGroupsStayInTheirProfile();
    void profileNamesMayHoldAnything_data();
    void profileNamesMayHoldAnything();

    void valuesSurvive_data();
    void valuesSurvive();
    void layoutOfTheFile();
    void removedValuesStayRemoved();
    void theProfileSurvives();
    void aMissingFileIsEmpty();
    void nothingIsWrittenWithoutAChange();
    void anotherProgramsValuesStay();
    void anEmptyPathKeepsNothing();
    void changingThePathWritesFirst();
    void aBrokenFileIsSetAside_data();
    void aBrokenFileIsSetAside();
    void whatCannotBeReadIsLeftAlone();
    void whatCannotBeWrittenStaysPending();
    void theEndOfTheApplicationWrites();
    void changesAreWrittenSoon();

    void languages_data();
    void languages();
    void theSystemsLanguageHasAName();
    void programInfo();

private:
    ZtAppSettings *m_settings = ZtAppSettings::getInstance();
};

void ZtAppSettingsTest::init()
{
    StatReportTest::init();
    m_settings->setStoragePath(QString());
    ZtStatusLog::getInstance()->clear();
}

void ZtAppSettingsTest::cleanup()
{
    m_settings->setStoragePath(QString());
    ZtAppSettings::setProgramInfo(QString(), QString(), QString());
    StatReportTest::cleanup();
}

void ZtAppSettingsTest::aMissingValueHasItsDefault()
{
    QVERIFY(!ZtAppSettings::value(QStringLiteral("missing")).isValid());
    QCOMPARE(ZtAppSettings::value(QStringLiteral("missing"), 7).toInt(), 7);
    QVERIFY(!ZtAppSettings::contains(QStringLiteral("missing")));
    ZtAppSettings::setValue(QStringLiteral("present"), 3);
    QCOMPARE(ZtAppSettings::value(QStringLiteral("present"), 7).toInt(), 3);
    QVERIFY(ZtAppSettings::contains(QStringLiteral("present")));
}

void ZtAppSettingsTest::groupsNest()
{
    ZtAppSettings::beginGroup(QStringLiteral("Outer"));
    ZtAppSettings::setValue(QStringLiteral("k"), 1);
    ZtAppSettings::beginGroup(QStringLiteral("Inner"));
    ZtAppSettings::setValue(QStringLiteral("k"), 2);
    ZtAppSettings::endGroup();
    QCOMPARE(ZtAppSettings::value(QStringLiteral("k")).toInt(), 1);
    QCOMPARE(ZtAppSettings::value(QStringLiteral("Inner/k")).toInt(), 2);
    ZtAppSettings::endGroup();
    QCOMPARE(valueIn(QStringLiteral("Outer/Inner"), QStringLiteral("k")).toInt(), 2);
    QCOMPARE(ZtAppSettings::value(QStringLiteral("Outer/k")).toInt(), 1);
    QVERIFY(!ZtAppSettings::contains(QStringLiteral("k")));
}

void ZtAppSettingsTest::absoluteGroupsIgnoreWhatIsOpen()
{
    ZtAppSettings::beginGroup(QStringLiteral("Open"));
    ZtAppSettings::beginGroupAbsolute(QStringLiteral("Root"));
    ZtAppSettings::setValue(QStringLiteral("k"), 5);
    ZtAppSettings::beginGroup(QStringLiteral("Below"));
    ZtAppSettings::setValue(QStringLiteral("k"), 6);
    ZtAppSettings::endGroup();
    ZtAppSettings::endGroup();
    QVERIFY(!ZtAppSettings::contains(QStringLiteral("k")));
    ZtAppSettings::endGroup();
    QCOMPARE(absoluteValueIn(QStringLiteral("Root"), QStringLiteral("k")).toInt(), 5);
    QCOMPARE(absoluteValueIn(QStringLiteral("Root/Below"), QStringLiteral("k")).toInt(), 6);
    QVERIFY(!valueIn(QStringLiteral("Root"), QStringLiteral("k")).isValid());
}

void ZtAppSettingsTest::withoutAGroupKeysBelongToTheProfile()
{
    ZtAppSettings::setValue(QStringLiteral("folder"), QStringLiteral("/a"));
    QVERIFY(!absoluteValueIn(QString(), QStringLiteral("folder")).isValid());
    m_settings->setCurrentProfile(QStringLiteral("Other"));
    QVERIFY(!ZtAppSettings::contains(QStringLiteral("folder")));
}

void ZtAppSettingsTest::superfluousSlashesDoNotMatter_data()
{
    QTest::addColumn<QString>("group");
    QTest::addColumn<QString>("key");
    QTest::newRow("none") << QStringLiteral("A/B") << QStringLiteral("k");
    QTest::newRow("around the group") << QStringLiteral("/A/B/") << QStringLiteral("k");
    QTest::newRow("doubled") << QStringLiteral("A//B") << QStringLiteral("k");
    QTest::newRow("before the key") << QStringLiteral("A") << QStringLiteral("/B/k");
    QTest::newRow("after the key") << QStringLiteral("A") << QStringLiteral("B//k/");
    QTest::newRow("empty group") << QString() << QStringLiteral("A/B/k");
    QTest::newRow("group of slashes") << QStringLiteral("//") << QStringLiteral("A/B/k");
}

void ZtAppSettingsTest::superfluousSlashesDoNotMatter()
{
    QFETCH(QString, group);
    QFETCH(QString, key);
    setValueIn(group, key, 9);
    QCOMPARE(valueIn(QStringLiteral("A/B"), QStringLiteral("k")).toInt(), 9);
    QCOMPARE(valueIn(group, key).toInt(), 9);
}

void ZtAppSettingsTest::anEmptyKeyIsRefused()
{
    expectWarning(QRegularExpression(QStringLiteral("empty key")));
    ZtAppSettings::setValue(QStringLiteral("/"), 1);
    QVERIFY(!ZtAppSettings::contains(QString()));
}

void ZtAppSettingsTest::endingNoGroupIsHarmless()
{
    expectWarning(QRegularExpression(QStringLiteral("no group is open")));
    ZtAppSettings::endGroup();
    setValueIn(QStringLiteral("G"), QStringLiteral("k"), 1);
    QCOMPARE(valueIn(QStringLiteral("G"), QStringLiteral("k")).toInt(), 1);
}

void ZtAppSettingsTest::listsTheKeysOfTheOpenGroup()
{
    QCOMPARE(ZtAppSettings::childKeys(), QStringList());
    ZtAppSettings::setValue(QStringLiteral("b"), 1);
    ZtAppSettings::setValue(QStringLiteral("G/z"), 2);
    ZtAppSettings::setValue(QStringLiteral("G/a b"), 3);
    ZtAppSettings::setValue(QStringLiteral("G/deeper/c"), 4);
    ZtAppSettings::setValue(QStringLiteral("GG/d"), 5);
    QCOMPARE(ZtAppSettings::childKeys(), QStringList(QStringLiteral("b")));
    ZtAppSettings::beginGroup(QStringLiteral("G"));
    const QStringList keys = ZtAppSettings::childKeys();
    ZtAppSettings::endGroup();
    QCOMPARE(keys, QStringList({QStringLiteral("a b"), QStringLiteral("z")}));
}

void ZtAppSettingsTest::removingTakesWhatIsBelow()
{
    ZtAppSettings::setValue(QStringLiteral("A"), 1);
    ZtAppSettings::setValue(QStringLiteral("A/b"), 2);
    ZtAppSettings::setValue(QStringLiteral("Ab"), 3);
    ZtAppSettings::remove(QStringLiteral("A"));
    QVERIFY(!ZtAppSettings::contains(QStringLiteral("A")));
    QVERIFY(!ZtAppSettings::contains(QStringLiteral("A/b")));
    QCOMPARE(ZtAppSettings::value(QStringLiteral("Ab")).toInt(), 3);
}

void ZtAppSettingsTest::removingTheOpenGroup()
{
    setValueIn(QStringLiteral("A"), QStringLiteral("x"), 1);
    setValueIn(QStringLiteral("A/B"), QStringLiteral("y"), 2);
    setValueIn(QStringLiteral("C"), QStringLiteral("z"), 3);
    ZtAppSettings::beginGroup(QStringLiteral("A"));
    ZtAppSettings::remove(QString());
    ZtAppSettings::endGroup();
    QVERIFY(!valueIn(QStringLiteral("A"), QStringLiteral("x")).isValid());
    QVERIFY(!valueIn(QStringLiteral("A/B"), QStringLiteral("y")).isValid());
    QCOMPARE(valueIn(QStringLiteral("C"), QStringLiteral("z")).toInt(), 3);
}

void ZtAppSettingsTest::anInvalidValueRemoves()
{
    ZtAppSettings::setValue(QStringLiteral("k"), 1);
    ZtAppSettings::setValue(QStringLiteral("k"), QVariant());
    QVERIFY(!ZtAppSettings::contains(QStringLiteral("k")));
    QCOMPARE(ZtAppSettings::value(QStringLiteral("k"), 4).toInt(), 4);
}

void ZtAppSettingsTest::changesAreAnnouncedAtOnceWithoutAGroup()
{
    QSignalSpy modified(m_settings, SIGNAL(signalValuesModified(QStringList,QList<QVariant>)));
    ZtAppSettings::setValue(QStringLiteral("k"), 1);
    QCOMPARE(modified.count(), 1);
    QCOMPARE(modified.at(0).at(0).toStringList(), QStringList(QStringLiteral("k")));
    QCOMPARE(modified.at(0).at(1).toList(), QVariantList{1});
}

void ZtAppSettingsTest::changesAreAnnouncedOnceAtTheLastClose()
{
    QSignalSpy modified(m_settings, SIGNAL(signalValuesModified(QStringList,QList<QVariant>)));
    ZtAppSettings::beginGroup(QStringLiteral("Outer"));
    ZtAppSettings::setValue(QStringLiteral("first"), 1);
    ZtAppSettings::beginGroup(QStringLiteral("Inner"));
    ZtAppSettings::setValue(QStringLiteral("second"), 2);
    ZtAppSettings::endGroup();
    ZtAppSettings::beginGroupAbsolute(QStringLiteral("Root"));
    ZtAppSettings::setValue(QStringLiteral("third"), 3);
    ZtAppSettings::endGroup();
    QCOMPARE(modified.count(), 0);
    ZtAppSettings::endGroup();
    QCOMPARE(modified.count(), 1);
    QCOMPARE(modified.at(0).at(0).toStringList(),
             QStringList({QStringLiteral("first"), QStringLiteral("second"), QStringLiteral("third")}));
    QCOMPARE(modified.at(0).at(1).toList(), QVariantList({1, 2, 3}));
}

void ZtAppSettingsTest::onlyRealChangesAreAnnounced_data()
{
    QTest::addColumn<QVariant>("before");
    QTest::addColumn<QVariant>("after");
    QTest::addColumn<bool>("announced");
    QTest::newRow("same number") << QVariant(5) << QVariant(5) << false;
    QTest::newRow("other number") << QVariant(5) << QVariant(6) << true;
    QTest::newRow("number as the file reads it") << QVariant(QStringLiteral("5")) << QVariant(5) << false;
    QTest::newRow("flag as the file reads it") << QVariant(QStringLiteral("true")) << QVariant(true) << false;
    QTest::newRow("flag for a text") << QVariant(QStringLiteral("abc")) << QVariant(true) << true;
    QTest::newRow("letter case") << QVariant(QStringLiteral("a")) << QVariant(QStringLiteral("A")) << true;
    QTest::newRow("same list") << QVariant(QStringList{QStringLiteral("a")})
                               << QVariant(QStringList{QStringLiteral("a")}) << false;
    QTest::newRow("list of one as the file reads it")
        << QVariant(QStringLiteral("a")) << QVariant(QStringList{QStringLiteral("a")}) << false;
    QTest::newRow("other list") << QVariant(QStringList{QStringLiteral("a")})
                                << QVariant(QStringList{QStringLiteral("a"), QStringLiteral("b")}) << true;
    QTest::newRow("new, though empty") << QVariant() << QVariant(QString()) << true;
    QTest::newRow("removed") << QVariant(0) << QVariant() << true;
    QTest::newRow("removed without being there") << QVariant() << QVariant() << false;
}

void ZtAppSettingsTest::onlyRealChangesAreAnnounced()
{
    QFETCH(QVariant, before);
    QFETCH(QVariant, after);
    QFETCH(bool, announced);
    ZtAppSettings::setValue(QStringLiteral("k"), before);
    QSignalSpy modified(m_settings, SIGNAL(signalValuesModified(QStringList,QList<QVariant>)));
    ZtAppSettings::setValue(QStringLiteral("k"), after);
    QCOMPARE(modified.count(), announced ? 1 : 0);
}

void ZtAppSettingsTest::aChangeTakenBackIsNoChange()
{
    setValueIn(QStringLiteral("G"), QStringLiteral("k"), 1);
    QSignalSpy modified(m_settings, SIGNAL(signalValuesModified(QStringList,QList<QVariant>)));
    ZtAppSettings::beginGroup(QStringLiteral("G"));
    ZtAppSettings::setValue(QStringLiteral("k"), 2);
    ZtAppSettings::setValue(QStringLiteral("k"), 1);
    ZtAppSettings::endGroup();
    QCOMPARE(modified.count(), 0);
}

void ZtAppSettingsTest::theLastOfSeveralChangesCounts()
{
    QSignalSpy modified(m_settings, SIGNAL(signalValuesModified(QStringList,QList<QVariant>)));
    ZtAppSettings::beginGroup(QStringLiteral("G"));
    ZtAppSettings::setValue(QStringLiteral("k"), 1);
    ZtAppSettings::setValue(QStringLiteral("k"), 2);
    ZtAppSettings::endGroup();
    QCOMPARE(modified.count(), 1);
    QCOMPARE(modified.at(0).at(0).toStringList(), QStringList(QStringLiteral("k")));
    QCOMPARE(modified.at(0).at(1).toList(), QVariantList{2});
}

void ZtAppSettingsTest::removalsAreAnnounced()
{
    setValueIn(QStringLiteral("G"), QStringLiteral("k"), 1);
    QSignalSpy modified(m_settings, SIGNAL(signalValuesModified(QStringList,QList<QVariant>)));
    ZtAppSettings::beginGroup(QStringLiteral("G"));
    ZtAppSettings::remove(QStringLiteral("k"));
    ZtAppSettings::endGroup();
    QCOMPARE(modified.count(), 1);
    QCOMPARE(modified.at(0).at(0).toStringList(), QStringList(QStringLiteral("k")));
    QVERIFY(!modified.at(0).at(1).toList().constFirst().isValid());
}

void ZtAppSettingsTest::receiversMayUseTheSettings()
{
    const BusyReceiver receiver;
    setValueIn(QStringLiteral("G"), QStringLiteral("k"), 8);
    QCOMPARE(receiver.seen, QStringList({QStringLiteral("k"), QStringLiteral("last")}));
    QCOMPARE(valueIn(QStringLiteral("Mirror"), QStringLiteral("last")).toInt(), 8);
}

void ZtAppSettingsTest::profilesKeepTheirOwnValues()
{
    setValueIn(QStringLiteral("G"), QStringLiteral("k"), 1);
    m_settings->setCurrentProfile(QStringLiteral("Night shift"));
    QVERIFY(!valueIn(QStringLiteral("G"), QStringLiteral("k")).isValid());
    setValueIn(QStringLiteral("G"), QStringLiteral("k"), 2);
    m_settings->setCurrentProfile(QString());
    QCOMPARE(valueIn(QStringLiteral("G"), QStringLiteral("k")).toInt(), 1);
    m_settings->setCurrentProfile(QStringLiteral("Night shift"));
    QCOMPARE(valueIn(QStringLiteral("G"), QStringLiteral("k")).toInt(), 2);
}

void ZtAppSettingsTest::absoluteGroupsAreSharedByProfiles()
{
    ZtAppSettings::beginGroupAbsolute(QStringLiteral("Shared"));
    ZtAppSettings::setValue(QStringLiteral("k"), 1);
    ZtAppSettings::endGroup();
    m_settings->setCurrentProfile(QStringLiteral("Other"));
    QCOMPARE(absoluteValueIn(QStringLiteral("Shared"), QStringLiteral("k")).toInt(), 1);
}

void ZtAppSettingsTest::profilesAreListed()
{
    QCOMPARE(m_settings->profiles(), QStringList(QString()));
    m_settings->setCurrentProfile(QStringLiteral("b"));
    QCOMPARE(m_settings->profiles(), QStringList(QString()));
    ZtAppSettings::setValue(QStringLiteral("k"), 1);
    m_settings->setCurrentProfile(QStringLiteral("a"));
    ZtAppSettings::setValue(QStringLiteral("k"), 1);
    QCOMPARE(m_settings->profiles(), QStringList({QString(), QStringLiteral("a"), QStringLiteral("b")}));
}

void ZtAppSettingsTest::profileChangesAreAnnounced()
{
    QSignalSpy changed(m_settings, SIGNAL(signalProfileChanged()));
    m_settings->setCurrentProfile(QString());
    QCOMPARE(changed.count(), 0);
    m_settings->setCurrentProfile(QStringLiteral("p"));
    QCOMPARE(changed.count(), 1);
    QCOMPARE(m_settings->currentProfile(), QStringLiteral("p"));
    m_settings->setCurrentProfile(QStringLiteral("p"));
    QCOMPARE(changed.count(), 1);
}

void ZtAppSettingsTest::openGroupsStayInTheirProfile()
{
    ZtAppSettings::beginGroup(QStringLiteral("G"));
    m_settings->setCurrentProfile(QStringLiteral("p"));
    ZtAppSettings::setValue(QStringLiteral("k"), 1);
    ZtAppSettings::endGroup();
    QVERIFY(!valueIn(QStringLiteral("G"), QStringLiteral("k")).isValid());
    m_settings->setCurrentProfile(QString());
    QCOMPARE(valueIn(QStringLiteral("G"), QStringLiteral("k")).toInt(), 1);
}

void ZtAppSettingsTest::profileNamesMayHoldAnything_data()
{
    QTest::addColumn<QString>("profile");
    QTest::newRow("slash") << QStringLiteral("a/b");
    QTest::newRow("umlaut") << QStringLiteral("Übung");
    QTest::newRow("percent") << QStringLiteral("50%");
    QTest::newRow("blank") << QStringLiteral(" ");
    QTest::newRow("brackets") << QStringLiteral("[x]=1;");
    QTest::newRow("the folders' own names") << QStringLiteral("DefaultProfile");
}

void ZtAppSettingsTest::profileNamesMayHoldAnything()
{
    QFETCH(QString, profile);
    const QString path = temporaryPath(QStringLiteral("names.ini"));
    QFile::remove(path);
    m_settings->setStoragePath(path);
    m_settings->setCurrentProfile(profile);
    setValueIn(QStringLiteral("G"), QStringLiteral("k"), 1);
    m_settings->setStoragePath(QString());
    m_settings->setStoragePath(path);
    QCOMPARE(m_settings->currentProfile(), profile);
    QCOMPARE(m_settings->profiles(), QStringList({QString(), profile}));
    QCOMPARE(valueIn(QStringLiteral("G"), QStringLiteral("k")).toInt(), 1);
}

void ZtAppSettingsTest::valuesSurvive_data()
{
    QTest::addColumn<QVariant>("value");
    QTest::newRow("text") << QVariant(QStringLiteral("plain"));
    QTest::newRow("empty text") << QVariant(QStringLiteral(""));
    QTest::newRow("letters of the world") << QVariant(QStringLiteral("Ünï 测量 µm²"));
    QTest::newRow("marks of the format") << QVariant(QStringLiteral("@x,\"y\";[z]=\\ % \n\t"));
    QTest::newRow("windows path") << QVariant(QStringLiteral("C:\\Users\\x"));
    QTest::newRow("number") << QVariant(-42);
    QTest::newRow("fraction") << QVariant(0.1);
    QTest::newRow("tiny") << QVariant(5e-324);
    QTest::newRow("flag") << QVariant(true);
    QTest::newRow("list") << QVariant(QStringList{QStringLiteral("a, b"), QString(), QStringLiteral("ç")});
    QTest::newRow("bytes") << QVariant(QByteArray("\0\1\xff", 3));
    QTest::newRow("size") << QVariant(QSize(3, 4));
}

void ZtAppSettingsTest::valuesSurvive()
{
    QFETCH(QVariant, value);
    const QString path = temporaryPath(QStringLiteral("survive.ini"));
    QFile::remove(path);
    m_settings->setStoragePath(path);
    setValueIn(QStringLiteral("G"), QStringLiteral("k"), value);
    QVERIFY(m_settings->sync());
    m_settings->setStoragePath(QString());
    QVERIFY(!valueIn(QStringLiteral("G"), QStringLiteral("k")).isValid());
    m_settings->setStoragePath(path);
    QVariant read = valueIn(QStringLiteral("G"), QStringLiteral("k"));
    QVERIFY(read.convert(value.userType()));
    QCOMPARE(read, value);
    QVERIFY(ZtStatusLog::getInstance()->entries().isEmpty());
}

void ZtAppSettingsTest::layoutOfTheFile()
{
    const QString path = temporaryPath(QStringLiteral("layout.ini"));
    m_settings->setStoragePath(path);
    setValueIn(QStringLiteral("G"), QStringLiteral("k"), 1);
    m_settings->setCurrentProfile(QStringLiteral("p"));
    setValueIn(QStringLiteral("G"), QStringLiteral("k"), 2);
    ZtAppSettings::beginGroupAbsolute(QStringLiteral("Root"));
    ZtAppSettings::setValue(QStringLiteral("k"), 3);
    ZtAppSettings::endGroup();
    QVERIFY(m_settings->sync());
    const QByteArray text = readFile(path);
    QVERIFY(text.contains("[DefaultProfile]\nG\\k=1\n"));
    QVERIFY(text.contains("[Profiles]\np\\G\\k=2\n"));
    QVERIFY(text.contains("[Root]\nk=3\n"));
    QVERIFY(text.contains("[Settings]\nCurrentProfile=p\n"));
}

void ZtAppSettingsTest::removedValuesStayRemoved()
{
    const QString path = temporaryPath(QStringLiteral("removed.ini"));
    m_settings->setStoragePath(path);
    ZtAppSettings::setValue(QStringLiteral("a"), 1);
    ZtAppSettings::setValue(QStringLiteral("b"), 2);
    QVERIFY(m_settings->sync());
    ZtAppSettings::remove(QStringLiteral("a"));
    m_settings->setStoragePath(QString());
    m_settings->setStoragePath(path);
    QVERIFY(!ZtAppSettings::contains(QStringLiteral("a")));
    QCOMPARE(ZtAppSettings::value(QStringLiteral("b")).toInt(), 2);
}

void ZtAppSettingsTest::theProfileSurvives()
{
    const QString path = temporaryPath(QStringLiteral("profile.ini"));
    m_settings->setStoragePath(path);
    m_settings->setCurrentProfile(QStringLiteral("p"));
    m_settings->setStoragePath(QString());
    QCOMPARE(m_settings->currentProfile(), QString());
    m_settings->setStoragePath(path);
    QCOMPARE(m_settings->currentProfile(), QStringLiteral("p"));
    m_settings->setCurrentProfile(QString());
    m_settings->setStoragePath(QString());
    m_settings->setStoragePath(path);
    QCOMPARE(m_settings->currentProfile(), QString());
}

void ZtAppSettingsTest::aMissingFileIsEmpty()
{
    const QString path = temporaryPath(QStringLiteral("not/there/yet.ini"));
    m_settings->setStoragePath(path);
    QCOMPARE(m_settings->storagePath(), path);
    QVERIFY(!ZtAppSettings::contains(QStringLiteral("k")));
    QVERIFY(ZtStatusLog::getInstance()->entries().isEmpty());
    ZtAppSettings::setValue(QStringLiteral("k"), 1);
    QVERIFY(m_settings->sync());
    QVERIFY(QFile::exists(path));
}

// A program that is killed has not lost its settings.
void ZtAppSettingsTest::changesAreWrittenSoon()
{
    const QString path = temporaryPath(QStringLiteral("soon.ini"));
    m_settings->setStoragePath(path);
    ZtAppSettings::setValue(QStringLiteral("k"), 1);
    QVERIFY(!QFile::exists(path));
    QTRY_VERIFY(readFile(path).contains("k=1"));
    ZtAppSettings::setValue(QStringLiteral("k"), 2);
    QTRY_VERIFY(readFile(path).contains("k=2"));
    ZtAppSettings::remove(QStringLiteral("k"));
    QTRY_VERIFY(!readFile(path).contains("k="));
}

void ZtAppSettingsTest::nothingIsWrittenWithoutAChange()
{
    const QString path = temporaryPath(QStringLiteral("untouched.ini"));
    m_settings->setStoragePath(path);
    QVERIFY(m_settings->sync());
    QVERIFY(!QFile::exists(path));
}

void ZtAppSettingsTest::anotherProgramsValuesStay()
{
    const QString path = temporaryPath(QStringLiteral("shared.ini"));
    m_settings->setStoragePath(path);
    QVERIFY(writeFile(path, "[DefaultProfile]\ntheirs=1\n"));
    ZtAppSettings::setValue(QStringLiteral("ours"), 2);
    QVERIFY(m_settings->sync());
    const QByteArray text = readFile(path);
    QVERIFY(text.contains("theirs=1"));
    QVERIFY(text.contains("ours=2"));
}

void ZtAppSettingsTest::anEmptyPathKeepsNothing()
{
    ZtAppSettings::setValue(QStringLiteral("k"), 1);
    QVERIFY(m_settings->sync());
    QCOMPARE(ZtAppSettings::value(QStringLiteral("k")).toInt(), 1);
    m_settings->setStoragePath(QString());
    QVERIFY(!ZtAppSettings::contains(QStringLiteral("k")));
}

void ZtAppSettingsTest::changingThePathWritesFirst()
{
    const QString path = temporaryPath(QStringLiteral("first.ini"));
    m_settings->setStoragePath(path);
    ZtAppSettings::setValue(QStringLiteral("k"), 1);
    QSignalSpy changed(m_settings, SIGNAL(signalProfileChanged()));
    m_settings->setStoragePath(temporaryPath(QStringLiteral("second.ini")));
    QVERIFY(readFile(path).contains("k=1"));
    QVERIFY(!ZtAppSettings::contains(QStringLiteral("k")));
    QCOMPARE(changed.count(), 1);
}

void ZtAppSettingsTest::aBrokenFileIsSetAside_data()
{
    QTest::addColumn<QByteArray>("text");
    QTest::newRow("no value") << QByteArray("[DefaultProfile]\nk=1\nnonsense\n");
    QTest::newRow("open bracket") << QByteArray("[DefaultProfile\nk=1\n");
    QTest::newRow("bytes") << QByteArray("\x89PNG\r\n\x1a\n\0\0\0\rIHDR\0\1\2\3", 20);
    QTest::newRow("other format") << QByteArray("{ \"k\": 1 }");
}

void ZtAppSettingsTest::aBrokenFileIsSetAside()
{
    QFETCH(QByteArray, text);
    const QString path = temporaryPath(QStringLiteral("broken.ini"));
    const QString aside = path + QStringLiteral(".broken");
    QVERIFY(writeFile(path, text));

    m_settings->setStoragePath(path);
    QVERIFY(!ZtAppSettings::contains(QStringLiteral("k")));
    QCOMPARE(readFile(aside), text);
    const QVector<ZtStatusEntry> entries = ZtStatusLog::getInstance()->entries();
    QCOMPARE(entries.size(), 1);
    QCOMPARE(entries.constFirst().category, int(ZtAppStatus::Error));
    QVERIFY(entries.constFirst().message.contains(path));

    ZtAppSettings::setValue(QStringLiteral("other"), 2);
    QVERIFY(m_settings->sync());
    QCOMPARE(readFile(path), QByteArray("[DefaultProfile]\nother=2\n"));
    QCOMPARE(readFile(aside), text);
    m_settings->setStoragePath(QString());
    m_settings->setStoragePath(path);
    QCOMPARE(ZtAppSettings::value(QStringLiteral("other")).toInt(), 2);
    QCOMPARE(ZtStatusLog::getInstance()->entries().size(), 1);
}

void ZtAppSettingsTest::whatCannotBeReadIsLeftAlone()
{
    const QString folder = temporaryPath(QStringLiteral("folder.ini"));
    QVERIFY(QDir().mkpath(folder));
    m_settings->setStoragePath(folder);
    QCOMPARE(ZtStatusLog::getInstance()->entries().size(), 1);
    ZtAppSettings::setValue(QStringLiteral("k"), 1);
    QCOMPARE(ZtAppSettings::value(QStringLiteral("k")).toInt(), 1);
    QVERIFY(!m_settings->sync());
    QVERIFY(QFileInfo(folder).isDir());
}

void ZtAppSettingsTest::whatCannotBeWrittenStaysPending()
{
    const QString blocked = temporaryPath(QStringLiteral("blocked"));
    QVERIFY(writeFile(blocked, "a file where a folder is needed"));
    m_settings->setStoragePath(blocked + QStringLiteral("/settings.ini"));
    ZtAppSettings::setValue(QStringLiteral("k"), 1);
    QVERIFY(!m_settings->sync());
    QCOMPARE(ZtStatusLog::getInstance()->entries().size(), 1);
    QVERIFY(QFile::remove(blocked));
    QVERIFY(m_settings->sync());
    QVERIFY(readFile(m_settings->storagePath()).contains("k=1"));
}

void ZtAppSettingsTest::theEndOfTheApplicationWrites()
{
    const QString path = temporaryPath(QStringLiteral("child/settings.ini"));
    QProcess child;
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(QStringLiteral("STATREPORT_SETTINGS"), path);
    child.setProcessEnvironment(environment);
    child.start(QCoreApplication::applicationFilePath(), {QLatin1String(leaveArgument)});
    QVERIFY(child.waitForFinished());
    QCOMPARE(child.exitStatus(), QProcess::NormalExit);
    QCOMPARE(child.exitCode(), 0);
    m_settings->setStoragePath(path);
    QCOMPARE(valueIn(QStringLiteral("Child"), QStringLiteral("greeting")).toString(), QStringLiteral("bye"));
}

void ZtAppSettingsTest::languages_data()
{
    QTest::addColumn<QString>("locale");
    QTest::addColumn<QString>("expected");
    const auto row = [](const char *locale, const char *expected) {
        QTest::newRow(locale) << QString::fromLatin1(locale) << QString::fromLatin1(expected);
    };
    row("C", "English");
    row("en_US", "English");
    row("en_GB", "English");
    row("de_DE", "German");
    row("de_AT", "German");
    row("fr_CA", "French");
    row("es_MX", "Spanish");
    row("it_IT", "Italian");
    row("ru_RU", "Russian");
    row("ja_JP", "Japanese");
    row("ko_KR", "Korean");
    row("ar_EG", "Arabic");
    row("zh_CN", "ChineseSimple");
    row("zh_SG", "ChineseSimple");
    row("zh_TW", "ChineseTraditional");
    row("zh_HK", "ChineseTraditional");
    row("zh_MO", "ChineseTraditional");
    row("sk_SK", "Slovakian");
    row("sl_SI", "English");
    row("pt_BR", "English");
}

void ZtAppSettingsTest::languages()
{
    QFETCH(QString, locale);
    const QString name = ZtAppSettings::getLanguageName(QLocale(locale));
    QTEST(name, "expected");
}

void ZtAppSettingsTest::theSystemsLanguageHasAName()
{
    QCOMPARE(ZtAppSettings::getSystemLanguageName(), ZtAppSettings::getLanguageName(QLocale::system()));
}

void ZtAppSettingsTest::programInfo()
{
    QCoreApplication::setApplicationName(QStringLiteral("tool"));
    QCoreApplication::setApplicationVersion(QStringLiteral("1.2"));
    QCoreApplication::setOrganizationName(QStringLiteral("maker"));
    QCOMPARE(ZtAppSettings::getProgramName(), QStringLiteral("tool"));
    QCOMPARE(ZtAppSettings::getProgramVersion(), QStringLiteral("1.2"));
    QCOMPARE(ZtAppSettings::getVendor(), QStringLiteral("maker"));

    ZtAppSettings::setProgramInfo(QStringLiteral("Shown name"), QString(), QStringLiteral("Shown maker"));
    QCOMPARE(ZtAppSettings::getProgramName(), QStringLiteral("Shown name"));
    QCOMPARE(ZtAppSettings::getProgramVersion(), QStringLiteral("1.2"));
    QCOMPARE(ZtAppSettings::getVendor(), QStringLiteral("Shown maker"));
}

int main(int argc, char **argv)
{
    if (argc == 2 && qstrcmp(argv[1], leaveArgument) == 0)
        return writeAndLeave(argc, argv);
    return runStatReportTest(argc, argv, []() -> StatReportTest * { return new ZtAppSettingsTest; });
}
#include "ZtAppSettingsTest.moc"

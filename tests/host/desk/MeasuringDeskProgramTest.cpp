// SPDX-License-Identifier: MIT
#include "DeskFiles.h"

#include <QProcess>

class MeasuringDeskProgramTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void textsNeedNoDisplay_data();
    void textsNeedNoDisplay();
    void wrongUsage();
    void runsUntilItIsEnded();
    void endsInOrder();

private:
    static QProcessEnvironment environment(const QString &platform)
    {
        QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
        environment.insert(QStringLiteral("QT_QPA_PLATFORM"), platform);
        environment.insert(QStringLiteral("STATREPORT_SETTINGS"),
                           temporaryPath(QStringLiteral("settings.ini")));
        environment.insert(QStringLiteral("STATREPORT_RECOVERY_DIR"),
                           temporaryPath(QStringLiteral("recovery")));
        return environment;
    }
};

void MeasuringDeskProgramTest::textsNeedNoDisplay_data()
{
    QTest::addColumn<QString>("option");
    QTest::addColumn<QString>("language");
    QTest::addColumn<QByteArray>("start");
    const QString english = QStringLiteral("C.UTF-8");
    QTest::newRow("help") << QStringLiteral("--help") << english
                          << QByteArray("Usage: measuringdesk [OPTION...]");
    QTest::newRow("help in German") << QStringLiteral("--help") << QStringLiteral("de_DE.UTF-8")
                                    << QByteArray("Aufruf: measuringdesk [OPTION...]");
    QTest::newRow("version") << QStringLiteral("--version") << english
                             << QByteArray("measuringdesk " STATREPORT_VERSION "\n");
}

void MeasuringDeskProgramTest::textsNeedNoDisplay()
{
    QFETCH(QString, option);
    QFETCH(QString, language);
    QFETCH(QByteArray, start);
    QProcessEnvironment speaking = environment(QStringLiteral("xcb:none"));
    speaking.insert(QStringLiteral("LC_ALL"), language);
    speaking.remove(QStringLiteral("LANGUAGE"));
    QProcess process;
    process.setProcessEnvironment(speaking);
    process.start(QStringLiteral(MEASURING_DESK), {option});
    QVERIFY(process.waitForFinished(30000));
    QCOMPARE(process.exitCode(), 0);
    QCOMPARE(process.readAllStandardOutput().left(start.size()), start);
}

void MeasuringDeskProgramTest::wrongUsage()
{
    QProcess process;
    process.setProcessEnvironment(environment(QStringLiteral("offscreen")));
    process.start(QStringLiteral(MEASURING_DESK), {QStringLiteral("--theme"), QStringLiteral("Blue")});
    QVERIFY(process.waitForFinished(30000));
    QCOMPARE(process.exitCode(), 2);
    // Qt may have something to say of the user's folders before that.
    const QByteArray errors = process.readAllStandardError();
    QVERIFY2(
        errors.endsWith("measuringdesk: There is no theme \"Blue\": use Dark or Light (measuringdesk --help "
                        "tells more)\n"),
        errors.constData());
}

void MeasuringDeskProgramTest::runsUntilItIsEnded()
{
    QProcess process;
    process.setProcessEnvironment(environment(QStringLiteral("offscreen")));
    process.start(QStringLiteral(MEASURING_DESK),
                  {QStringLiteral("--theme"), QStringLiteral("Light"), QStringLiteral("--plugins"),
                   QStringLiteral(FAKE_PLUGINS "/GoodPlugin"), DeskFiles::demoSession()});
    QVERIFY(process.waitForStarted(30000));
    QVERIFY(!process.waitForFinished(3000));
    process.terminate();
    QVERIFY(process.waitForFinished(30000));
    const QByteArray errors = process.readAllStandardError();
    QVERIFY2(!errors.contains("QObject::connect"), errors.constData());
    QVERIFY2(!errors.contains("QMetaObject"), errors.constData());
}

void MeasuringDeskProgramTest::endsInOrder()
{
    QProcessEnvironment closing = environment(QStringLiteral("offscreen"));
    closing.insert(QStringLiteral("FAKE_PLUGIN_CLOSES"), QStringLiteral("1"));
    QProcess process;
    process.setProcessEnvironment(closing);
    process.start(QStringLiteral(MEASURING_DESK),
                  {QStringLiteral("--plugins"), QStringLiteral(FAKE_PLUGINS "/GoodPlugin"),
                   QStringLiteral("--plugins"), QStringLiteral(FAKE_PLUGINS "/EarlyPlugin"),
                   DeskFiles::demoSession()});
    QVERIFY(process.waitForFinished(60000));
    QCOMPARE(process.exitStatus(), QProcess::NormalExit);
    QCOMPARE(process.exitCode(), 0);
    QStringList lines;
    for (const QString &line : QString::fromUtf8(process.readAllStandardError()).split(QLatin1Char('\n'))) {
        if (line.contains(QLatin1String("Plugin")) || line.contains(QLatin1String("about to close")))
            lines.append(line);
    }
    // Both plug-ins are told, once each.
    const QString about = QStringLiteral("about to close window DeskMainWindow");
    QCOMPARE(lines, QStringList({QStringLiteral("initialize EarlyPlugin tools"),
                                 QStringLiteral("initialize GoodPlugin tools"), about, about,
                                 QStringLiteral("delete GoodPlugin window DeskMainWindow"),
                                 QStringLiteral("delete EarlyPlugin window DeskMainWindow")}));
}

STATREPORT_TEST_MAIN(MeasuringDeskProgramTest)
#include "MeasuringDeskProgramTest.moc"

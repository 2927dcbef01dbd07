// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "FinishedProcess.h"

#include <QDir>

/** Installs the build, moves the tree, and uses it as if nothing else were there. */
class InstallationTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void initTestCase();

    void everythingIsThere_data();
    void everythingIsThere();
    void knowsNothingOfTheBuild_data();
    void knowsNothingOfTheBuild();
    void programsStart_data();
    void programsStart();
    void rendersAnExample();
    void everythingThatTheGuideNamesIsThere();
    void manualsAreReadable_data();
    void manualsAreReadable();
    void sessionHasItsType();
    void aHostIsBuiltWithTheSdk();

private:
    QString installed(const QString &path) const { return m_prefix + QLatin1Char('/') + path; }
    static QProcessEnvironment environment();

    QString m_prefix;
};

QProcessEnvironment InstallationTest::environment()
{
    QProcessEnvironment result = QProcessEnvironment::systemEnvironment();
    result.insert(QStringLiteral("STATREPORT_SETTINGS"), temporaryPath(QStringLiteral("settings.ini")));
    result.remove(QStringLiteral("LD_LIBRARY_PATH"));
    return result;
}

void InstallationTest::initTestCase()
{
    const QString first = temporaryPath(QStringLiteral("first"));
    const FinishedProcess install = FinishedProcess::run(
        QStringLiteral(STATREPORT_CMAKE), {QStringLiteral("--install"), QStringLiteral(STATREPORT_BUILD_DIR),
                                           QStringLiteral("--prefix"), first});
    QVERIFY2(install.exitCode == 0, qPrintable(install.output));
    m_prefix = temporaryPath(QStringLiteral("moved tree"));
    QVERIFY(QDir().rename(first, m_prefix));
}

void InstallationTest::everythingIsThere_data()
{
    QTest::addColumn<QString>("path");
    const QString libraries = QStringLiteral(STATREPORT_LIBDIR);
    for (const char *library : {"ztcommon", "ztimage", "ztkernel", "ztgui", "ztmeasuring"})
        QTest::newRow(library) << QStringLiteral("%1/lib%2.so.0").arg(libraries, QLatin1String(library));
    for (const char *path : {"bin/measuringdesk",
                             "bin/statreport",
                             "lib/statreport/bin/Templates/demo.rtp",
                             "lib/statreport/plugins/StatReportingPlugin.so",
                             "share/statreport/examples/sessions/demo.json",
                             "share/statreport/examples/pictures/plate.png",
                             "share/applications/org.statreport.measuringdesk.desktop",
                             "share/metainfo/org.statreport.measuringdesk.metainfo.xml",
                             "share/mime/packages/statreport.xml",
                             "share/icons/hicolor/scalable/apps/org.statreport.measuringdesk.svg",
                             "share/icons/hicolor/scalable/mimetypes/application-x-statreport-template.svg",
                             "share/man/man1/statreport.1.gz",
                             "share/man/man1/measuringdesk.1.gz",
                             "share/doc/measuringdesk/changelog.gz",
                             "share/doc/libstatreporthost0/changelog.gz",
                             "share/measuringdesk/guide/user-guide.md",
                             "share/bash-completion/completions/statreport",
                             "share/zsh/site-functions/_statreport",
                             "share/fish/vendor_completions.d/statreport.fish",
                             "include/statreport-host/gui/ZtPluginInterface.h",
                             "share/statreport/examples/minimalhost/CMakeLists.txt"})
        QTest::newRow(path) << QString::fromLatin1(path);
    QTest::newRow("package") << libraries +
                                    QStringLiteral("/cmake/StatReportHost/StatReportHostConfig.cmake");
}

void InstallationTest::everythingIsThere()
{
    QFETCH(QString, path);
    QVERIFY2(QFileInfo(installed(path)).isFile(), qPrintable(path));
}

void InstallationTest::knowsNothingOfTheBuild_data()
{
    QTest::addColumn<QString>("path");
    for (const char *path :
         {"bin/measuringdesk", "bin/statreport", "lib/statreport/plugins/StatReportingPlugin.so"})
        QTest::newRow(path) << QString::fromLatin1(path);
    QTest::newRow("a library") << QStringLiteral(STATREPORT_LIBDIR "/libztmeasuring.so.0");
}

void InstallationTest::knowsNothingOfTheBuild()
{
    QFETCH(QString, path);
    const FinishedProcess found = FinishedProcess::run(
        QStringLiteral("ldd"), {QFileInfo(installed(path)).canonicalFilePath()}, environment());
    QCOMPARE(found.exitCode, 0);
    QVERIFY2(!found.output.contains(QStringLiteral("not found")), qPrintable(found.output));
    QVERIFY2(!found.output.contains(QStringLiteral(STATREPORT_BUILD_DIR)), qPrintable(found.output));
    QVERIFY2(found.output.contains(m_prefix + QStringLiteral("/lib")), qPrintable(found.output));
}

void InstallationTest::programsStart_data()
{
    QTest::addColumn<QString>("program");
    QTest::newRow("measuringdesk") << QStringLiteral("measuringdesk");
    QTest::newRow("statreport") << QStringLiteral("statreport");
}

void InstallationTest::programsStart()
{
    QFETCH(QString, program);
    const FinishedProcess started = FinishedProcess::run(installed(QStringLiteral("bin/") + program),
                                                         {QStringLiteral("--version")}, environment());
    QCOMPARE(started.exitCode, 0);
    QCOMPARE(started.output, program + QStringLiteral(" " STATREPORT_VERSION "\n"));
}

void InstallationTest::rendersAnExample()
{
    const QString pdf = temporaryPath(QStringLiteral("report.pdf"));
    const FinishedProcess rendered = FinishedProcess::run(
        installed(QStringLiteral("bin/statreport")),
        {QStringLiteral("render"), installed(QStringLiteral("lib/statreport/bin/Templates/demo.rtp")),
         QStringLiteral("--session"),
         installed(QStringLiteral("share/statreport/examples/sessions/demo.json")), QStringLiteral("-o"),
         pdf},
        environment());
    QVERIFY2(rendered.exitCode == 0, qPrintable(rendered.output));
    QCOMPARE(FinishedProcess::run(QStringLiteral("qpdf"), {QStringLiteral("--check"), pdf}).exitCode, 0);
}

void InstallationTest::everythingThatTheGuideNamesIsThere()
{
    const QString folder = installed(QStringLiteral("share/measuringdesk/guide/"));
    const QStringList guides{QStringLiteral("user-guide*.md")};
    QCOMPARE(QDir(folder).entryList(guides), QDir(sourcePath(QStringLiteral("docs"))).entryList(guides));
    QFile guide(folder + QStringLiteral("user-guide.md"));
    QVERIFY(guide.open(QIODevice::ReadOnly));
    QSet<QString> named;
    QRegularExpressionMatchIterator links = QRegularExpression(QStringLiteral("\\]\\(([^)#:]+)\\)"))
                                                .globalMatch(QString::fromUtf8(guide.readAll()));
    while (links.hasNext())
        named.insert(links.next().captured(1));
    QVERIFY(named.contains(QStringLiteral("pictures/guide-desk.png")));
    QVERIFY(named.contains(QStringLiteral("tables.md")));
    for (const QString &file : qAsConst(named))
        QVERIFY2(QFileInfo(folder + file).size() > 0, qPrintable(file));
    // And no other pictures.
    const int pictures = named.values().filter(QStringLiteral("pictures/")).size();
    QCOMPARE(QDir(folder + QStringLiteral("pictures")).entryList(QDir::Files).size(), pictures);
}

void InstallationTest::manualsAreReadable_data()
{
    QTest::addColumn<QString>("program");
    QTest::newRow("measuringdesk") << QStringLiteral("measuringdesk");
    QTest::newRow("statreport") << QStringLiteral("statreport");
}

void InstallationTest::manualsAreReadable()
{
    QFETCH(QString, program);
    const FinishedProcess shown =
        FinishedProcess::run(QStringLiteral("mandoc"),
                             {QStringLiteral("-T"), QStringLiteral("markdown"),
                              installed(QStringLiteral("share/man/man1/%1.1.gz").arg(program))},
                             environment());
    QCOMPARE(shown.exitCode, 0);
    QVERIFY2(shown.output.contains(QStringLiteral("# SYNOPSIS")), qPrintable(shown.output));
}

// By what is in it: the suffix says no more than that it is JSON.
void InstallationTest::sessionHasItsType()
{
    const QString data = temporaryPath(QStringLiteral("data"));
    QVERIFY(QDir().mkpath(data + QStringLiteral("/mime/packages")));
    QVERIFY(QFile::copy(installed(QStringLiteral("share/mime/packages/statreport.xml")),
                        data + QStringLiteral("/mime/packages/statreport.xml")));
    QCOMPARE(FinishedProcess::run(QStringLiteral("update-mime-database"), {data + QStringLiteral("/mime")})
                 .exitCode,
             0);
    QProcessEnvironment found = environment();
    found.insert(QStringLiteral("XDG_DATA_DIRS"), data + QStringLiteral(":/usr/share"));
    found.insert(QStringLiteral("HOME"), temporaryPath(QStringLiteral("home")));
    found.remove(QStringLiteral("XDG_DATA_HOME"));
    const QString copy = temporaryPath(QStringLiteral("demo"));
    QVERIFY(QFile::copy(installed(QStringLiteral("share/statreport/examples/sessions/demo.json")), copy));
    const FinishedProcess type = FinishedProcess::run(QStringLiteral(STATREPORT_MIME_TYPE_OF),
                                                      {QStringLiteral("--mime-type-of"), copy}, found);
    QCOMPARE(type.output.trimmed(), QStringLiteral("application/x-measuringdesk-session"));
}

void InstallationTest::aHostIsBuiltWithTheSdk()
{
    const QString build = temporaryPath(QStringLiteral("minimalhost"));
    const FinishedProcess configured = FinishedProcess::run(
        QStringLiteral(STATREPORT_CMAKE),
        {QStringLiteral("-S"), installed(QStringLiteral("share/statreport/examples/minimalhost")),
         QStringLiteral("-B"), build, QStringLiteral("-G"), QStringLiteral("Ninja"),
         QStringLiteral("-DCMAKE_CXX_COMPILER=" STATREPORT_COMPILER),
         QStringLiteral("-DCMAKE_PREFIX_PATH=") + m_prefix},
        environment());
    QVERIFY2(configured.exitCode == 0, qPrintable(configured.output));
    const FinishedProcess built = FinishedProcess::run(QStringLiteral(STATREPORT_CMAKE),
                                                       {QStringLiteral("--build"), build}, environment());
    QVERIFY2(built.exitCode == 0, qPrintable(built.output));
    QProcessEnvironment offscreen = environment();
    offscreen.insert(QStringLiteral("QT_QPA_PLATFORM"), QStringLiteral("offscreen"));
    const FinishedProcess checked =
        FinishedProcess::run(build + QStringLiteral("/minimalhost"), {QStringLiteral("--check")}, offscreen);
    QVERIFY2(checked.exitCode == 0, qPrintable(checked.output));
    QVERIFY2(checked.output.contains(QStringLiteral("Report & Statistic")), qPrintable(checked.output));
}

STATREPORT_TEST_MAIN(InstallationTest)
#include "InstallationTest.moc"

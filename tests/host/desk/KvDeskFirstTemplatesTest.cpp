// SPDX-License-Identifier: MIT
#include "KvDeskFirstTemplates.h"

#include "kernel/ZtAppSettings.h"
#include "support/StatReportTest.h"

class KvDeskFirstTemplatesTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void simplestFirst();
    void onlyTheFirstTime();

private:
    static QStringList offered()
    {
        return ZtAppSettings::value(QStringLiteral("StatReporting/ReportTemplatePaths")).toStringList();
    }
};

void KvDeskFirstTemplatesTest::simplestFirst()
{
    const QStringList paths = KvDeskFirstTemplates::in(sourcePath(QStringLiteral("examples/templates")));
    QCOMPARE(paths.size(), 5);
    QCOMPARE(paths.first(), sourcePath(QStringLiteral("examples/templates/summary.rtp")));
    QCOMPARE(KvDeskFirstTemplates::in(temporaryPath(QStringLiteral("missing"))), QStringList());
}

void KvDeskFirstTemplatesTest::onlyTheFirstTime()
{
    ZtAppSettings::getInstance()->setStoragePath(QString());
    const QString folder = sourcePath(QStringLiteral("examples/templates"));
    KvDeskFirstTemplates::offer(folder);
    QCOMPARE(offered(), KvDeskFirstTemplates::in(folder));
    ZtAppSettings::setValue(QStringLiteral("StatReporting/ReportTemplatePaths"), QStringList());
    KvDeskFirstTemplates::offer(folder);
    QCOMPARE(offered(), QStringList());
}

STATREPORT_TEST_MAIN(KvDeskFirstTemplatesTest)
#include "KvDeskFirstTemplatesTest.moc"

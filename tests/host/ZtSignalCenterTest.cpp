// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "kernel/ZtSignalCenter.h"

class ZtSignalCenterTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void isTheSameForAll();
    void signatures_data();
    void signatures();
    void plainSignalsArrive_data();
    void plainSignalsArrive();
};

void ZtSignalCenterTest::isTheSameForAll()
{
    QVERIFY(ZtSignalCenter::getInstance() != nullptr);
    QCOMPARE(ZtSignalCenter::getInstance(), ZtSignalCenter::getInstance());
}

/// Receivers connect by these texts, so a changed one breaks them at run time only.
void ZtSignalCenterTest::signatures_data()
{
    QTest::addColumn<QByteArray>("signature");
    for (const char *const signature :
         {"signalObjectCreated(int,int,const ZtKernelObjectData*)",
          "signalObjectChanged(int,int,const ZtKernelObjectData*)", "signalObjectRemoved(int,int)",
          "signalLengthUnitChanged()", "signalAngleUnitChanged()", "signalAppAboutToClose()"})
        QTest::newRow(signature) << QByteArray(signature);
}

void ZtSignalCenterTest::signatures()
{
    QFETCH(QByteArray, signature);
    const QMetaObject *const meta = ZtSignalCenter::getInstance()->metaObject();
    QVERIFY(meta->indexOfSignal(signature.constData()) >= 0);
}

void ZtSignalCenterTest::plainSignalsArrive_data()
{
    QTest::addColumn<QByteArray>("name");
    for (const char *const name :
         {"signalLengthUnitChanged", "signalAngleUnitChanged", "signalAppAboutToClose"})
        QTest::newRow(name) << QByteArray(name);
}

void ZtSignalCenterTest::plainSignalsArrive()
{
    QFETCH(QByteArray, name);
    const QByteArray signal = QByteArray::number(QSIGNAL_CODE) + name + "()";
    QSignalSpy spy(ZtSignalCenter::getInstance(), signal.constData());
    QVERIFY(QMetaObject::invokeMethod(ZtSignalCenter::getInstance(), name.constData()));
    QCOMPARE(spy.count(), 1);
}

STATREPORT_TEST_MAIN(ZtSignalCenterTest)
#include "ZtSignalCenterTest.moc"

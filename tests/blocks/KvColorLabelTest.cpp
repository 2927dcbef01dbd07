// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "KvTextDocumentDialogProbe.h"
#include "widgets/KvColorLabel.h"

#include <QColorDialog>
#include <QPointer>

namespace {
using ColorDialogProbe = KvTextDocumentDialogProbe<QColorDialog>;
}

class KvColorLabelTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void startsCyan();
    void showsItsColor_data();
    void showsItsColor();
    void settingEmitsNothing();
    void asksForAColor();
    void emitsOnlyAnotherColor_data();
    void emitsOnlyAnotherColor();
    void keysOpenTheDialog();
    void mayDieWhileTheDialogIsOpen();

private:
    static QImage iconOf(const KvColorLabel &label)
    {
        return label.icon().pixmap(QSize(24, 24)).toImage().convertToFormat(QImage::Format_ARGB32);
    }
};

void KvColorLabelTest::startsCyan()
{
    const KvColorLabel label;
    QVERIFY(label.inherits("QPushButton"));
    QCOMPARE(label.objectName(), QStringLiteral("colorLabel"));
    QCOMPARE(label.color(), QColor(Qt::cyan));
    QCOMPARE(label.iconSize(), QSize(24, 24));
    QCOMPARE(iconOf(label).pixelColor(12, 12), QColor(Qt::cyan));
}

void KvColorLabelTest::showsItsColor_data()
{
    QTest::addColumn<QColor>("color");
    QTest::newRow("black") << QColor(Qt::black);
    QTest::newRow("white") << QColor(Qt::white);
    QTest::newRow("mixed") << QColor(17, 34, 51);
}

void KvColorLabelTest::showsItsColor()
{
    QFETCH(QColor, color);
    KvColorLabel label;
    label.setColor(Qt::red);
    label.setColor(color);
    QCOMPARE(label.color(), color);
    const QImage icon = iconOf(label);
    QCOMPARE(icon.size(), QSize(24, 24));
    for (const QPoint corner : {QPoint(0, 0), QPoint(23, 0), QPoint(0, 23), QPoint(23, 23)})
        QCOMPARE(icon.pixelColor(corner), color);
}

void KvColorLabelTest::settingEmitsNothing()
{
    KvColorLabel label;
    const QSignalSpy changed(&label, SIGNAL(signalColorChanged(QColor)));
    QVERIFY(changed.isValid());
    label.setColor(Qt::red);
    label.setColor(Qt::blue);
    QCOMPARE(changed.count(), 0);
}

void KvColorLabelTest::asksForAColor()
{
    KvColorLabel label;
    label.setColor(QColor(1, 2, 3));
    QColor offered;
    bool hasParent = true;
    QColorDialog::ColorDialogOptions options = QColorDialog::NoButtons;
    QString title;
    const ColorDialogProbe probe([&](QColorDialog *dialog) {
        offered = dialog->currentColor();
        hasParent = dialog->parentWidget() != nullptr;
        options = dialog->options();
        title = dialog->windowTitle();
        dialog->reject();
    });
    label.click();
    QCOMPARE(probe.count(), 1);
    QCOMPARE(offered, QColor(1, 2, 3));
    QVERIFY(!hasParent);
    QCOMPARE(int(options), 0);
    QCOMPARE(title, QColorDialog().windowTitle()); // no title of its own
}

void KvColorLabelTest::emitsOnlyAnotherColor_data()
{
    QTest::addColumn<QColor>("chosen");
    QTest::addColumn<bool>("accepted");
    QTest::addColumn<int>("emitted");
    QTest::newRow("another") << QColor(200, 10, 20) << true << 1;
    QTest::newRow("the same") << QColor(1, 2, 3) << true << 0;
    QTest::newRow("cancelled") << QColor(200, 10, 20) << false << 0;
}

void KvColorLabelTest::emitsOnlyAnotherColor()
{
    QFETCH(QColor, chosen);
    QFETCH(bool, accepted);
    QFETCH(int, emitted);
    const QColor old(1, 2, 3);
    KvColorLabel label;
    label.setColor(old);
    const QSignalSpy changed(&label, SIGNAL(signalColorChanged(QColor)));
    const ColorDialogProbe probe([&](QColorDialog *dialog) {
        dialog->setCurrentColor(chosen);
        accepted ? dialog->accept() : dialog->reject();
    });
    label.click();
    QCOMPARE(probe.count(), 1);
    QCOMPARE(changed.count(), emitted);
    const QColor expected = emitted > 0 ? chosen : old;
    QCOMPARE(label.color(), expected);
    QCOMPARE(iconOf(label).pixelColor(5, 5), expected);
    if (emitted > 0)
        QCOMPARE(changed.first().first().value<QColor>(), chosen);
}

void KvColorLabelTest::keysOpenTheDialog()
{
    KvColorLabel label;
    label.show();
    QVERIFY(QTest::qWaitForWindowExposed(&label));
    const ColorDialogProbe probe([](QColorDialog *dialog) { dialog->reject(); });
    QTest::keyClick(&label, Qt::Key_Space);
    QCOMPARE(probe.count(), 1);
}

void KvColorLabelTest::mayDieWhileTheDialogIsOpen()
{
    const QPointer<KvColorLabel> label(new KvColorLabel);
    const ColorDialogProbe probe([&](QColorDialog *dialog) {
        delete label;
        dialog->setCurrentColor(Qt::red);
        dialog->accept();
    });
    // Not click(), which itself is used to buttons that die.
    QMetaObject::invokeMethod(label, "slotClicked");
    QCOMPARE(probe.count(), 1);
    QVERIFY(!label);
}

STATREPORT_TEST_MAIN(KvColorLabelTest)
#include "KvColorLabelTest.moc"

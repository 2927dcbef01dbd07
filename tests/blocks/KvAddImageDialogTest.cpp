// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "blocks/textdocument/KvAddImageDialog.h"
#include "blocks/textdocument/KvEditorAddImageExtWidget.h"

#include <QComboBox>
#include <QImage>
#include <QLineEdit>
#include <QSpinBox>

class KvAddImageDialogTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void asksForOneExistingImage();
    void asksForWidthAndPlaceBelow();
    void givesTheChosenFile();
    void refusesAMissingFile();
};

void KvAddImageDialogTest::asksForOneExistingImage()
{
    const KvAddImageDialog dialog;
    QCOMPARE(dialog.windowTitle(), QStringLiteral("Choose image file"));
    QCOMPARE(dialog.nameFilters(), QStringList{"Image file(*.png *.jpg *.gif *.tif *.bmp)"});
    QCOMPARE(dialog.fileMode(), QFileDialog::ExistingFile);
    QCOMPARE(dialog.acceptMode(), QFileDialog::AcceptOpen);
    QVERIFY(dialog.testOption(QFileDialog::DontUseNativeDialog));
    QCOMPARE(dialog.selectedFile(), QString());
}

void KvAddImageDialogTest::asksForWidthAndPlaceBelow()
{
    KvAddImageDialog dialog;
    auto *extension = dialog.findChild<KvEditorAddImageExtWidget *>();
    QVERIFY(extension);
    QVERIFY(dialog.layout()->indexOf(extension) >= 0);
    QCOMPARE(dialog.widthPercent(), 25);
    QCOMPARE(dialog.placement(), QStringLiteral("style=\"float:none;\""));
    extension->findChild<QSpinBox *>()->setValue(40);
    extension->findChild<QComboBox *>()->setCurrentIndex(2);
    QCOMPARE(dialog.widthPercent(), 40);
    QCOMPARE(dialog.placement(), QStringLiteral("style=\"float:right;\""));

    dialog.show();
    QVERIFY(QTest::qWaitForWindowExposed(&dialog));
    const auto *fileName = dialog.findChild<QLineEdit *>(QStringLiteral("fileNameEdit"));
    QVERIFY(fileName);
    QVERIFY(extension->isVisible());
    QVERIFY(extension->mapTo(&dialog, QPoint()).y() > fileName->mapTo(&dialog, QPoint()).y());
    QVERIFY(dialog.rect().contains(extension->geometry()));
}

void KvAddImageDialogTest::givesTheChosenFile()
{
    const QString path = temporaryPath(QStringLiteral("chosen.png"));
    QImage image(4, 4, QImage::Format_RGB32);
    image.fill(Qt::red);
    QVERIFY(image.save(path));
    KvAddImageDialog dialog;
    dialog.setDirectory(QFileInfo(path).path());
    dialog.show();
    QVERIFY(QTest::qWaitForWindowExposed(&dialog));
    dialog.findChild<QLineEdit *>(QStringLiteral("fileNameEdit"))->setText(path);
    QTest::keyClick(&dialog, Qt::Key_Return);
    QTRY_COMPARE(dialog.result(), int(QDialog::Accepted));
    QCOMPARE(QFileInfo(dialog.selectedFile()), QFileInfo(path));
}

void KvAddImageDialogTest::refusesAMissingFile()
{
    KvAddImageDialog dialog;
    dialog.reject();
    QCOMPARE(dialog.result(), int(QDialog::Rejected));
    QCOMPARE(dialog.selectedFile(), QString());
}

STATREPORT_TEST_MAIN(KvAddImageDialogTest)
#include "KvAddImageDialogTest.moc"

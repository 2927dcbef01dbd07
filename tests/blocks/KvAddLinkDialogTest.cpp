// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "blocks/textdocument/KvAddLinkDialog.h"

#include <QDialogButtonBox>
#include <QFormLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>

class KvAddLinkDialogTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void hasTitleAndUrl();
    void suggestsATitle_data();
    void suggestsATitle();
    void makesALink_data();
    void makesALink();
    void acceptClearsTheFields();
    void cancelMakesNothing();
    void tabsFromTitleToUrl();

private:
    static QLineEdit *field(const KvAddLinkDialog &dialog, const char *name)
    {
        return dialog.findChild<QLineEdit *>(QLatin1String(name));
    }
    static QPushButton *button(const KvAddLinkDialog &dialog, QDialogButtonBox::StandardButton which)
    {
        return dialog.findChild<QDialogButtonBox *>(QStringLiteral("buttonBox"))->button(which);
    }
};

void KvAddLinkDialogTest::hasTitleAndUrl()
{
    const KvAddLinkDialog dialog(9);
    QCOMPARE(dialog.windowTitle(), QStringLiteral("Insert Link"));
    const auto *form = dialog.findChild<QFormLayout *>();
    QVERIFY(form);
    const QLineEdit *title = field(dialog, "titleInput");
    const QLineEdit *url = field(dialog, "urlInput");
    QVERIFY(title && url);
    const auto *titleLabel = dialog.findChild<QLabel *>(QStringLiteral("label"));
    const auto *urlLabel = dialog.findChild<QLabel *>(QStringLiteral("label_2"));
    QCOMPARE(titleLabel->text(), QStringLiteral("Title:"));
    QCOMPARE(urlLabel->text(), QStringLiteral("URL:"));
    QCOMPARE(titleLabel->buddy(), title);
    QCOMPARE(urlLabel->buddy(), url);
    QCOMPARE(form->itemAt(0, QFormLayout::FieldRole)->widget(), title);
    QCOMPARE(form->itemAt(1, QFormLayout::FieldRole)->widget(), url);
    QVERIFY(dialog.findChild<QFrame *>(QStringLiteral("line")));
    QVERIFY(button(dialog, QDialogButtonBox::Ok));
    QVERIFY(button(dialog, QDialogButtonBox::Cancel));
    QCOMPARE(dialog.html(), QString());
}

void KvAddLinkDialogTest::suggestsATitle_data()
{
    QTest::addColumn<QString>("title");
    QTest::addColumn<QString>("focused");
    QTest::newRow("none") << QString() << "titleInput";
    QTest::newRow("selection") << QStringLiteral("the seam") << "urlInput";
}

void KvAddLinkDialogTest::suggestsATitle()
{
    QFETCH(QString, title);
    KvAddLinkDialog dialog(9);
    dialog.setTitle(title);
    dialog.show();
    QVERIFY(QTest::qWaitForWindowActive(&dialog));
    QCOMPARE(field(dialog, "titleInput")->text(), title);
    QTEST(dialog.focusWidget()->objectName(), "focused");
}

void KvAddLinkDialogTest::makesALink_data()
{
    QTest::addColumn<QString>("title");
    QTest::addColumn<QString>("url");
    QTest::addColumn<qreal>("size");
    QTest::addColumn<QString>("html");
    QTest::newRow("plain") << "Home"
                           << "https://example.org" << 9.0
                           << "<a href=\"https://example.org\" style=\"font-size:9pt;\" >Home</a>"
                              "<span style=\"font-size:9pt;\"> </span>";
    QTest::newRow("fractional size") << "Home"
                                     << "u" << 9.75
                                     << "<a href=\"u\" style=\"font-size:9.75pt;\" >Home</a>"
                                        "<span style=\"font-size:9.75pt;\"> </span>";
    QTest::newRow("not escaped") << "a<b"
                                 << "x?a=1&b=2" << 12.0
                                 << "<a href=\"x?a=1&b=2\" style=\"font-size:12pt;\" >a<b</a>"
                                    "<span style=\"font-size:12pt;\"> </span>";
    QTest::newRow("percent signs") << "%1 %2"
                                   << "a%20%3" << 12.0
                                   << "<a href=\"a%20%3\" style=\"font-size:12pt;\" >%1 %2</a>"
                                      "<span style=\"font-size:12pt;\"> </span>";
    QTest::newRow("no url") << "t"
                            << "" << 8.0
                            << "<a href=\"\" style=\"font-size:8pt;\" >t</a>"
                               "<span style=\"font-size:8pt;\"> </span>";
    QTest::newRow("no title") << ""
                              << "https://example.org" << 9.0 << "";
}

void KvAddLinkDialogTest::makesALink()
{
    QFETCH(QString, title);
    QFETCH(QString, url);
    QFETCH(qreal, size);
    KvAddLinkDialog dialog(size);
    dialog.show();
    QVERIFY(QTest::qWaitForWindowExposed(&dialog));
    const QSignalSpy accepted(&dialog, SIGNAL(accepted()));
    QTest::keyClicks(field(dialog, "titleInput"), title);
    QTest::keyClicks(field(dialog, "urlInput"), url);
    QTest::keyClick(&dialog, Qt::Key_Return);
    QCOMPARE(accepted.count(), 1);
    QVERIFY(!dialog.isVisible());
    QTEST(dialog.html(), "html");
}

void KvAddLinkDialogTest::acceptClearsTheFields()
{
    KvAddLinkDialog dialog(9);
    field(dialog, "titleInput")->setText(QStringLiteral("t"));
    field(dialog, "urlInput")->setText(QStringLiteral("u"));
    button(dialog, QDialogButtonBox::Ok)->click();
    QCOMPARE(dialog.result(), int(QDialog::Accepted));
    QCOMPARE(field(dialog, "titleInput")->text(), QString());
    QCOMPARE(field(dialog, "urlInput")->text(), QString());
    QVERIFY(!dialog.html().isEmpty());

    // Also without a title, which makes no link.
    field(dialog, "urlInput")->setText(QStringLiteral("u"));
    button(dialog, QDialogButtonBox::Ok)->click();
    QCOMPARE(field(dialog, "urlInput")->text(), QString());
    QCOMPARE(dialog.html(), QString());
}

void KvAddLinkDialogTest::cancelMakesNothing()
{
    KvAddLinkDialog dialog(9);
    field(dialog, "titleInput")->setText(QStringLiteral("t"));
    const QSignalSpy rejected(&dialog, SIGNAL(rejected()));
    button(dialog, QDialogButtonBox::Cancel)->click();
    QCOMPARE(rejected.count(), 1);
    QCOMPARE(dialog.html(), QString());
}

void KvAddLinkDialogTest::tabsFromTitleToUrl()
{
    KvAddLinkDialog dialog(9);
    dialog.show();
    QVERIFY(QTest::qWaitForWindowActive(&dialog));
    QCOMPARE(dialog.focusWidget(), field(dialog, "titleInput"));
    QTest::keyClick(dialog.focusWidget(), Qt::Key_Tab);
    QCOMPARE(dialog.focusWidget(), field(dialog, "urlInput"));
}

STATREPORT_TEST_MAIN(KvAddLinkDialogTest)
#include "KvAddLinkDialogTest.moc"

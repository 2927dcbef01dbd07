// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "KvImagePanelProbe.h"
#include "MetaMethods.h"
#include "blocks/cameraimage/KvCameraImageNodeCfg.h"
#include "blocks/cameraimage/KvCameraImageNodeOptionsWidget.h"
#include "blocks/textdocument/KvTextDocumentNodeCfg.h"
#include "gui/QtAdvancedStylesheet.h"

#include <QCheckBox>
#include <QComboBox>
#include <QPushButton>
#include <QSpinBox>

using Panel = KvCameraImageNodeOptionsWidget;

class KvCameraImageNodeOptionsWidgetTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();
    void declaresSignalsAndSlotsInOrder();
    void hasItsTexts();
    void fitsTheSide();
    void tabGoesFromTopToBottom();
    void showsTheConfiguration_data();
    void showsTheConfiguration();
    void fillingEmitsNothing();
    void everyControlIsAnnounced();
    void alignmentIsClicked();
    void writesNothingItself();
    void withoutPlacementTwoRowsAreMissing();
    void ignoresOtherConfigurations();

private:
    std::unique_ptr<KvCameraImageNodeCfg> m_cfg;
    std::unique_ptr<Panel> m_panel;
};

void KvCameraImageNodeOptionsWidgetTest::init()
{
    StatReportTest::init();
    m_cfg = std::make_unique<KvCameraImageNodeCfg>(nullptr);
    m_panel = std::make_unique<Panel>(m_cfg.get(), nullptr, true);
    QVERIFY(PanelProbe::show(m_panel.get()));
}

void KvCameraImageNodeOptionsWidgetTest::cleanup()
{
    m_panel.reset();
    m_cfg.reset();
    StatReportTest::cleanup();
}

void KvCameraImageNodeOptionsWidgetTest::declaresSignalsAndSlotsInOrder()
{
    QCOMPARE(ownMethods(Panel::staticMetaObject, QMetaMethod::Signal),
             QStringList({"signalWidthChanged(int)", "signalAlignmentChanged(Qt::Alignment)",
                          "signalRotateAngleChanged(int)", "signalRenderMeasurementsStateChanged(int)"}));
    QCOMPARE(ownMethods(Panel::staticMetaObject, QMetaMethod::Slot),
             QStringList({"slotAngleIndexChanged()", "slotAlignLeftClicked()", "slotAlignCenterClicked()",
                          "slotAlignRightClicked()"}));
}

void KvCameraImageNodeOptionsWidgetTest::hasItsTexts()
{
    QCOMPARE(m_panel->findChild<QLabel *>(QStringLiteral("sideHeader"))->text(),
             QStringLiteral("Camera image view"));
    QCOMPARE(PanelProbe::buttonTexts<QCheckBox>(m_panel.get()), QStringList{"Render measurements"});
    QCOMPARE(PanelProbe::buttonTexts<QPushButton>(m_panel.get()), QStringList({"", "", ""}));
    const auto *box = m_panel->findChild<QComboBox *>();
    for (int i = 0; i < 4; ++i)
        QCOMPARE(box->itemData(i), QVariant(90 * i));
    QCOMPARE(m_panel->findChild<QSpinBox *>()->suffix(), QStringLiteral("%"));
    for (const QWidget *control : m_panel->findChildren<QAbstractButton *>())
        QVERIFY(!control->toolTip().isEmpty());
}

void KvCameraImageNodeOptionsWidgetTest::fitsTheSide()
{
    acss::QtAdvancedStylesheet::getInstance()->applyTo(qApp);
    Panel panel(m_cfg.get(), nullptr, true);
    panel.setFixedWidth(290);
    QVERIFY(PanelProbe::show(&panel));
    QVERIFY(panel.minimumSizeHint().width() <= 290);
    QCOMPARE(KvImagePanelProbe::controlHeights(&panel), QList<int>({28, 28, 24, 24, 24}));
    qApp->setStyleSheet(QString());
}

void KvCameraImageNodeOptionsWidgetTest::tabGoesFromTopToBottom()
{
    QList<QWidget *> expected{KvImagePanelProbe::widthBox(m_panel.get()),
                              KvImagePanelProbe::angleBox(m_panel.get())};
    for (QPushButton *button : KvImagePanelProbe::alignmentButtons(m_panel.get()))
        expected.append(button);
    expected.append(m_panel->findChild<QCheckBox *>());
    QCOMPARE(KvImagePanelProbe::tabChain(m_panel.get()), expected);
}

void KvCameraImageNodeOptionsWidgetTest::showsTheConfiguration_data()
{
    KvImagePanelProbe::addPlacementRows();
}

void KvCameraImageNodeOptionsWidgetTest::showsTheConfiguration()
{
    QFETCH(QVector<int>, placement);
    QFETCH(QString, shown);
    m_panel->findChild<QComboBox *>()->setCurrentIndex(2);
    m_cfg->setOptions({{Qt::Alignment(placement.at(0)), placement.at(1), placement.at(2)}, true});
    m_panel->setFromConfig(m_cfg.get());
    QCOMPARE(KvImagePanelProbe::shownPlacement(m_panel.get()), shown);
    QVERIFY(m_panel->findChild<QCheckBox *>()->isChecked());
    const Panel fresh(m_cfg.get(), nullptr, true);
    QCOMPARE(KvImagePanelProbe::shownPlacement(&fresh), shown);
}

void KvCameraImageNodeOptionsWidgetTest::fillingEmitsNothing()
{
    QSignalSpy width(m_panel.get(), SIGNAL(signalWidthChanged(int)));
    QSignalSpy alignment(m_panel.get(), SIGNAL(signalAlignmentChanged(Qt::Alignment)));
    QSignalSpy angle(m_panel.get(), SIGNAL(signalRotateAngleChanged(int)));
    QSignalSpy render(m_panel.get(), SIGNAL(signalRenderMeasurementsStateChanged(int)));
    KvCameraImageNodeCfg other(nullptr);
    other.setOptions({{Qt::AlignRight, 12, 270}, true});
    m_panel->setFromConfig(&other);
    QVERIFY(m_panel->findChild<QCheckBox *>()->isChecked());
    QCOMPARE(width.count() + alignment.count() + angle.count() + render.count(), 0);
}

void KvCameraImageNodeOptionsWidgetTest::everyControlIsAnnounced()
{
    QSignalSpy width(m_panel.get(), SIGNAL(signalWidthChanged(int)));
    QTest::keyClick(m_panel->findChild<QSpinBox *>(), Qt::Key_Down);
    QCOMPARE(width.count(), 1);
    QCOMPARE(width.first().first().toInt(), 74);
    QSignalSpy angle(m_panel.get(), SIGNAL(signalRotateAngleChanged(int)));
    for (int i = 1; i < 4; ++i) {
        QTest::keyClick(m_panel->findChild<QComboBox *>(), Qt::Key_Down);
        QCOMPARE(angle.count(), i);
        QCOMPARE(angle.last().first().toInt(), 90 * i);
    }
    QSignalSpy render(m_panel.get(), SIGNAL(signalRenderMeasurementsStateChanged(int)));
    QTest::keyClick(m_panel->findChild<QCheckBox *>(), Qt::Key_Space);
    QTest::keyClick(m_panel->findChild<QCheckBox *>(), Qt::Key_Space);
    QCOMPARE(render.count(), 2);
    QCOMPARE(render.at(0).first().toInt(), int(Qt::Checked));
    QCOMPARE(render.at(1).first().toInt(), int(Qt::Unchecked));
}

void KvCameraImageNodeOptionsWidgetTest::alignmentIsClicked()
{
    QCOMPARE(KvImagePanelProbe::clickAlignments(m_panel.get()), KvImagePanelProbe::properAlignments());
}

void KvCameraImageNodeOptionsWidgetTest::writesNothingItself()
{
    m_panel->findChild<QSpinBox *>()->setValue(3);
    m_panel->findChild<QComboBox *>()->setCurrentIndex(1);
    m_panel->findChild<QCheckBox *>()->setChecked(true);
    QVERIFY(m_cfg->options() == KvCameraImageNodeCfg::Options());
}

void KvCameraImageNodeOptionsWidgetTest::withoutPlacementTwoRowsAreMissing()
{
    Panel panel(m_cfg.get(), nullptr, false);
    QVERIFY(!panel.findChild<QSpinBox *>());
    QVERIFY(panel.findChildren<QPushButton *>().isEmpty());
    QVERIFY(panel.findChild<QComboBox *>());
    QVERIFY(panel.findChild<QCheckBox *>());
    panel.setFromConfig(m_cfg.get());
}

void KvCameraImageNodeOptionsWidgetTest::ignoresOtherConfigurations()
{
    KvTextDocumentNodeCfg text(nullptr);
    m_panel->setFromConfig(&text);
    m_panel->setFromConfig(nullptr);
    QCOMPARE(m_panel->findChild<QSpinBox *>()->value(), 75);
}

STATREPORT_TEST_MAIN(KvCameraImageNodeOptionsWidgetTest)
#include "KvCameraImageNodeOptionsWidgetTest.moc"

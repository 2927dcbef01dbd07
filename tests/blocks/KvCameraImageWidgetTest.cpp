// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "ConfigArgument.h"
#include "KvCameraImageSource.h"
#include "KvImageSamples.h"
#include "MetaMethods.h"
#include "PanelProbe.h"
#include "blocks/cameraimage/KvCameraImageNodeCfg.h"
#include "blocks/cameraimage/KvCameraImageNodeOptionsWidget.h"
#include "blocks/cameraimage/KvCameraImageWidget.h"
#include "data/KvReportKernelData.h"
#include "report/KvBaseDisplayWidgetSignals.h"
#include "templates/KvTemplateContext.h"

#include <QCheckBox>
#include <QComboBox>
#include <QPushButton>
#include <QSpinBox>

using KvImageSamples::areaOf;
using KvImageSamples::painted;

class KvCameraImageWidgetTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void declaresSlotsInOrder();
    void isOnePiece();

    void showsThePlaceholderAtFirst();
    void asksForAPictureAtOnce();
    void takesTheCachedPicture();
    void takesTheCachedPictureWithMeasurements();
    void followsTheCamera();
    void theOtherSignalIsIgnored_data();
    void theOtherSignalIsIgnored();
    void keepsThePictureOfACameraThatStops();

    void measurementsAreSwitchedOn();
    void measurementsAreSwitchedOff();
    void measurementsComeWithTheNextFrame();
    void anOldPictureIsRenewed();
    void everyBlockWishesForItself();

    void hintAndPaintingFollowThePlacement_data();
    void hintAndPaintingFollowThePlacement();

    void slotsAnnounceDifferences_data();
    void slotsAnnounceDifferences();
    void everyWidthIsKept();
    void panelIsConnected();
    void survivesTheAdapter();
    void worksWithoutAContext();

private:
    KvCameraImageWidget *makeWidget(bool renderMeasurements)
    {
        KvCameraImageNodeCfg::Options options;
        options.placement = {Qt::AlignLeft, 100, 0};
        options.renderMeasurements = renderMeasurements;
        m_cfg->setOptions(options);
        m_widget = std::make_unique<KvCameraImageWidget>(nullptr, m_cfg.get());
        return m_widget.get();
    }
    QImage look() { return painted(m_widget.get(), m_widget->sizeHint()); }
    bool showsPicture() { return areaOf(look(), Qt::green).width() > 700; }
    bool showsMeasurements() { return !areaOf(look(), Qt::red).isNull(); }

    std::unique_ptr<KvCameraImageSource> m_camera;
    std::unique_ptr<KvReportKernelData> m_data;
    std::unique_ptr<KvTemplateContext> m_context;
    std::unique_ptr<KvCameraImageNodeCfg> m_cfg;
    std::unique_ptr<KvCameraImageWidget> m_widget;
};

void KvCameraImageWidgetTest::init()
{
    StatReportTest::init();
    m_camera = std::make_unique<KvCameraImageSource>();
    m_data = std::make_unique<KvReportKernelData>();
    m_context = std::make_unique<KvTemplateContext>(m_data.get());
    m_context->setPageWidth(1000); // 760 between the margins
    m_context->setContentHeight(1302);
    m_cfg = std::make_unique<KvCameraImageNodeCfg>(m_context.get());
}

void KvCameraImageWidgetTest::cleanup()
{
    m_widget.reset();
    m_cfg.reset();
    m_context.reset();
    m_data.reset();
    m_camera.reset();
    StatReportTest::cleanup();
}

void KvCameraImageWidgetTest::declaresSlotsInOrder()
{
    QCOMPARE(ownMethods(KvCameraImageWidget::staticMetaObject, QMetaMethod::Slot),
             QStringList({"slotCameraImageChanged()", "slotCameraImageWithDataChanged()",
                          "slotWidthChanged(int)", "slotAlignmentChanged(Qt::Alignment)",
                          "slotRotateAngleChanged(int)", "slotRenderMeasurementsStateChanged(int)"}));
}

void KvCameraImageWidgetTest::isOnePiece()
{
    makeWidget(false);
    QCOMPARE(m_widget->displayName(), QStringLiteral("Camera Image View"));
    QCOMPARE(m_widget->subWidgetCount(), 1);
    QCOMPARE(m_widget->subWidgetAt(0), m_widget.get());
    QVERIFY(!m_widget->subWidgetAt(1));
    QCOMPARE(m_widget->sizePolicy().horizontalPolicy(), QSizePolicy::Expanding);
    QCOMPARE(m_widget->sizePolicy().verticalPolicy(), QSizePolicy::Minimum);
}

void KvCameraImageWidgetTest::showsThePlaceholderAtFirst()
{
    makeWidget(false); // the adapter is not active and has no picture
    QCOMPARE(m_widget->sizeHint(), QSize(760, 152));
    QVERIFY(!showsPicture());
}

void KvCameraImageWidgetTest::asksForAPictureAtOnce()
{
    m_data->setActive(true);
    const int requests = m_camera->requests();
    makeWidget(false);
    QCOMPARE(m_camera->requests(), requests + 1);
    QVERIFY(showsPicture());
}

void KvCameraImageWidgetTest::takesTheCachedPicture()
{
    m_data->setActive(true);
    m_data->setActive(false);
    m_camera->setSilent(true);
    makeWidget(false);
    QVERIFY(showsPicture());
    QCOMPARE(m_widget->sizeHint(), QSize(760, 570));
    QVERIFY(!showsMeasurements());
}

void KvCameraImageWidgetTest::takesTheCachedPictureWithMeasurements()
{
    m_data->setCameraImageWithDataWanted(true);
    m_data->setActive(true);
    m_data->setActive(false);
    m_camera->setSilent(true);
    makeWidget(true);
    QVERIFY(showsMeasurements());
    m_data->setCameraImageWithDataWanted(false);
}

void KvCameraImageWidgetTest::followsTheCamera()
{
    m_data->setActive(true);
    makeWidget(false);
    QSignalSpy changed(m_widget->displaySignals(), SIGNAL(signalWidgetChanged()));
    QSignalSpy modified(m_context.get(), SIGNAL(signalTemplateModified()));
    m_camera->setPicture(QSize(10, 10), Qt::blue);
    m_camera->deliver();
    QCOMPARE(changed.count(), 1);
    QCOMPARE(m_widget->sizeHint(), QSize(760, 760));
    QVERIFY(areaOf(look(), Qt::blue).width() > 700);
    QCOMPARE(modified.count(), 0);
}

void KvCameraImageWidgetTest::theOtherSignalIsIgnored_data()
{
    QTest::addColumn<bool>("render");
    QTest::newRow("plain") << false;
    QTest::newRow("with measurements") << true;
}

void KvCameraImageWidgetTest::theOtherSignalIsIgnored()
{
    QFETCH(bool, render);
    m_data->setActive(true);
    makeWidget(render);
    QSignalSpy changed(m_widget->displaySignals(), SIGNAL(signalWidgetChanged()));
    emit m_data->signalCameraImageChanged();
    QCOMPARE(changed.count(), render ? 0 : 1);
    emit m_data->signalCameraImageWithDataChanged();
    QCOMPARE(changed.count(), 1);
    QCOMPARE(showsMeasurements(), render);
}

void KvCameraImageWidgetTest::keepsThePictureOfACameraThatStops()
{
    m_data->setActive(true);
    makeWidget(false);
    ZtKernelData::getInstance()->setKernelImage(nullptr);
    m_data->slotDelayedPrepareCameraImage();
    m_data->setActive(false);
    QVERIFY(showsPicture());
}

void KvCameraImageWidgetTest::measurementsAreSwitchedOn()
{
    m_data->setActive(true);
    makeWidget(false);
    QVERIFY(!m_data->isCameraImageWithDataWanted());
    m_widget->slotRenderMeasurementsStateChanged(Qt::Checked);
    QVERIFY(m_data->isCameraImageWithDataWanted());
    QVERIFY(m_cfg->options().renderMeasurements);
    QVERIFY(showsMeasurements()); // this camera is fast
}

void KvCameraImageWidgetTest::measurementsAreSwitchedOff()
{
    m_data->setActive(true);
    makeWidget(true);
    QVERIFY(showsMeasurements());
    m_camera->setSilent(true);
    m_widget->slotRenderMeasurementsStateChanged(Qt::Unchecked);
    QVERIFY(!m_data->isCameraImageWithDataWanted());
    QVERIFY(showsPicture()); // the adapter has it
    QVERIFY(!showsMeasurements());
}

void KvCameraImageWidgetTest::measurementsComeWithTheNextFrame()
{
    m_data->setActive(true);
    makeWidget(false);
    m_camera->setSilent(true);
    m_widget->slotRenderMeasurementsStateChanged(Qt::Checked);
    QVERIFY(showsPicture()); // the plain one until then
    QVERIFY(!showsMeasurements());
    m_camera->deliver();
    QVERIFY(showsMeasurements());
}

void KvCameraImageWidgetTest::anOldPictureIsRenewed()
{
    m_data->setActive(true);
    makeWidget(true);
    m_widget->slotRenderMeasurementsStateChanged(Qt::Unchecked);
    m_camera->setPicture(QSize(40, 30), Qt::blue);
    m_camera->deliver();
    m_widget->slotRenderMeasurementsStateChanged(Qt::Checked);
    QVERIFY(showsMeasurements());
    QVERIFY(areaOf(look(), Qt::blue).width() > 700);
}

void KvCameraImageWidgetTest::everyBlockWishesForItself()
{
    KvCameraImageNodeCfg otherCfg(m_context.get());
    KvCameraImageNodeCfg::Options options;
    options.renderMeasurements = true;
    otherCfg.setOptions(options);
    auto other = std::make_unique<KvCameraImageWidget>(nullptr, &otherCfg);
    makeWidget(true);
    m_widget->slotRenderMeasurementsStateChanged(Qt::Unchecked);
    QVERIFY(m_data->isCameraImageWithDataWanted());
    m_widget->slotRenderMeasurementsStateChanged(Qt::Unchecked); // again: counts once
    QVERIFY(m_data->isCameraImageWithDataWanted());
    other.reset();
    QVERIFY(!m_data->isCameraImageWithDataWanted());
    m_widget->slotRenderMeasurementsStateChanged(Qt::Checked);
    m_widget->slotRenderMeasurementsStateChanged(Qt::Checked);
    m_widget.reset();
    QVERIFY(!m_data->isCameraImageWithDataWanted());
}

void KvCameraImageWidgetTest::hintAndPaintingFollowThePlacement_data()
{
    QTest::addColumn<int>("alignment");
    QTest::addColumn<int>("percent");
    QTest::addColumn<int>("rotation");
    QTest::addColumn<QRect>("area");
    QTest::newRow("left") << 1 << 50 << 0 << QRect(0, 0, 380, 285);
    QTest::newRow("centred") << 132 << 50 << 180 << QRect(190, 0, 380, 285);
    QTest::newRow("right, turned") << 2 << 30 << 90 << QRect(532, 0, 228, 304);
    QTest::newRow("turned the other way") << 1 << 30 << 270 << QRect(0, 0, 228, 304);
    QTest::newRow("small") << 1 << 1 << 0 << QRect(0, 0, 7, 5);
}

void KvCameraImageWidgetTest::hintAndPaintingFollowThePlacement()
{
    QFETCH(int, alignment);
    QFETCH(int, percent);
    QFETCH(int, rotation);
    QFETCH(QRect, area);
    m_data->setActive(true);
    makeWidget(false);
    m_widget->slotAlignmentChanged(Qt::Alignment(alignment));
    m_widget->slotWidthChanged(percent);
    m_widget->slotRotateAngleChanged(rotation);
    QCOMPARE(m_widget->sizeHint(), QSize(760, qMax(20, area.height())));
    QCOMPARE(areaOf(look(), Qt::green), area);
}

void KvCameraImageWidgetTest::slotsAnnounceDifferences_data()
{
    QTest::addColumn<int>("slot");
    QTest::newRow("width") << 0;
    QTest::newRow("alignment") << 1;
    QTest::newRow("rotation") << 2;
    QTest::newRow("measurements") << 3;
}

void KvCameraImageWidgetTest::slotsAnnounceDifferences()
{
    QFETCH(int, slot);
    makeWidget(false);
    QSignalSpy config(m_widget->displaySignals(),
                      SIGNAL(signalWidgetConfigChanged(const KvBaseEditorNodeCfg*)));
    QSignalSpy modified(m_context.get(), SIGNAL(signalTemplateModified()));
    QSignalSpy changed(m_widget->displaySignals(), SIGNAL(signalWidgetChanged()));
    const auto call = [this, slot](bool other) {
        if (slot == 0)
            m_widget->slotWidthChanged(other ? 33 : 100);
        else if (slot == 1)
            m_widget->slotAlignmentChanged(other ? Qt::AlignRight : Qt::AlignLeft);
        else if (slot == 2)
            m_widget->slotRotateAngleChanged(other ? 90 : 0);
        else
            m_widget->slotRenderMeasurementsStateChanged(other ? Qt::Checked : Qt::Unchecked);
    };
    call(false); // what it is already
    QCOMPARE(config.count(), 0);
    QCOMPARE(modified.count(), 0);
    QCOMPARE(changed.count(), 1);
    call(true);
    QCOMPARE(config.count(), 1);
    QCOMPARE(configArgument(config, 0), m_cfg.get());
    QCOMPARE(modified.count(), 1);
    QCOMPARE(changed.count(), 2);
    call(true);
    QCOMPARE(config.count(), 1);
    QCOMPARE(modified.count(), 1);
    QCOMPARE(changed.count(), 3);
    const KvCameraImageNodeCfg::Options options = m_cfg->options();
    QCOMPARE(options.placement.widthPercent, slot == 0 ? 33 : 100);
    QCOMPARE(int(options.placement.alignment), slot == 1 ? 2 : 1);
    QCOMPARE(options.placement.rotation, slot == 2 ? 90 : 0);
    QCOMPARE(options.renderMeasurements, slot == 3);
}

void KvCameraImageWidgetTest::everyWidthIsKept()
{
    makeWidget(false);
    QSignalSpy modified(m_context.get(), SIGNAL(signalTemplateModified()));
    for (int percent = 1; percent <= 100; ++percent) {
        m_widget->slotWidthChanged(percent);
        QCOMPARE(m_cfg->options().placement.widthPercent, percent);
        QCOMPARE(modified.count(), percent);
        m_widget->slotWidthChanged(percent);
        QCOMPARE(modified.count(), percent);
    }
}

void KvCameraImageWidgetTest::panelIsConnected()
{
    makeWidget(false);
    QSignalSpy modified(m_context.get(), SIGNAL(signalTemplateModified()));
    QWidget parent;
    QWidget *panel = m_widget->createOptionsWidget(&parent, true);
    QCOMPARE(panel->parentWidget(), &parent);
    QVERIFY(qobject_cast<KvCameraImageNodeOptionsWidget *>(panel));
    parent.show();
    panel->findChild<QSpinBox *>()->setValue(44);
    QCOMPARE(m_cfg->options().placement.widthPercent, 44);
    panel->findChild<QComboBox *>()->setCurrentIndex(3);
    QCOMPARE(m_cfg->options().placement.rotation, 270);
    PanelProbe::click(PanelProbe::controls<QPushButton>(panel).at(2));
    QCOMPARE(int(m_cfg->options().placement.alignment), 2);
    panel->findChild<QCheckBox *>()->setChecked(true);
    QVERIFY(m_cfg->options().renderMeasurements);
    QCOMPARE(modified.count(), 4);
    // Clicking what is checked already leaves the template as it is.
    PanelProbe::click(PanelProbe::controls<QPushButton>(panel).at(2));
    QCOMPARE(modified.count(), 4);
    const std::unique_ptr<QWidget> small(m_widget->createOptionsWidget(nullptr, false));
    QVERIFY(!small->findChild<QSpinBox *>());
}

void KvCameraImageWidgetTest::survivesTheAdapter()
{
    m_data->setActive(true);
    makeWidget(true);
    m_data.reset();
    m_widget->slotRenderMeasurementsStateChanged(Qt::Unchecked);
    m_widget->slotCameraImageChanged();
    m_widget->slotWidthChanged(10);
    QVERIFY(!areaOf(look(), Qt::green).isNull());
}

void KvCameraImageWidgetTest::worksWithoutAContext()
{
    KvCameraImageNodeCfg cfg(nullptr);
    KvCameraImageWidget widget(nullptr, &cfg);
    widget.slotRenderMeasurementsStateChanged(Qt::Checked);
    QVERIFY(cfg.options().renderMeasurements);
    painted(&widget, QSize(100, 100));
}

STATREPORT_TEST_MAIN(KvCameraImageWidgetTest)
#include "KvCameraImageWidgetTest.moc"

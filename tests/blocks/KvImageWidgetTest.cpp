// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "ConfigArgument.h"
#include "KvImageSamples.h"
#include "MetaMethods.h"
#include "PanelProbe.h"
#include "blocks/image/KvImageNodeCfg.h"
#include "blocks/image/KvImageNodeOptionsWidget.h"
#include "blocks/image/KvImageWidget.h"
#include "report/KvBaseDisplayWidgetSignals.h"
#include "templates/KvTemplateContext.h"

#include <QComboBox>
#include <QJsonObject>
#include <QLayout>
#include <QPushButton>
#include <QSpinBox>

using KvImageSamples::areaOf;
using KvImageSamples::painted;
using KvImageSamples::plain;

class KvImageWidgetTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void declaresSlotsInOrder();
    void isOnePiece();
    void hasItsSizePolicy();

    void hintFollowsPictureAndPage_data();
    void hintFollowsPictureAndPage();
    void hintOfAPlaceholder();
    void hintFollowsThePage();
    void hintFollowsTheConfiguration();
    void hintWithoutAPage();
    void survivesOddPages_data();
    void survivesOddPages();

    void paintsWhereItShould_data();
    void paintsWhereItShould();
    void paintsThePlaceholder();
    void turnsThePicture_data();
    void turnsThePicture();
    void shrinksSmoothly();
    void paintsTheNewPicture();

    void slotsAnnounceEveryCall_data();
    void slotsAnnounceEveryCall();
    void announcesInOrder();
    void everyWidthIsKept();
    void aPictureIsTaken();
    void worksWithoutAContext();

    void panelIsConnected();
    void panelWithoutPlacement();

private:
    /// Config changed, template modified, widget changed.
    QStringList m_log;
    std::unique_ptr<KvTemplateContext> m_context;
    std::unique_ptr<KvImageNodeCfg> m_cfg;
    std::unique_ptr<KvImageWidget> m_widget;
};

void KvImageWidgetTest::init()
{
    StatReportTest::init();
    m_log.clear();
    m_context = std::make_unique<KvTemplateContext>(nullptr);
    m_context->setPageWidth(1000); // 760 between the margins
    m_context->setContentHeight(1302);
    m_cfg = std::make_unique<KvImageNodeCfg>(m_context.get());
    m_cfg->setImage(QStringLiteral("/a.png"), plain(QSize(400, 200)));
    m_widget = std::make_unique<KvImageWidget>(nullptr, m_cfg.get());
    connect(m_widget->displaySignals(), &KvBaseDisplayWidgetSignals::signalWidgetConfigChanged, this,
            [this]() { m_log.append(QStringLiteral("config")); });
    connect(m_context.get(), &KvTemplateContext::signalTemplateModified, this,
            [this]() { m_log.append(QStringLiteral("modified")); });
    connect(m_widget->displaySignals(), &KvBaseDisplayWidgetSignals::signalWidgetChanged, this,
            [this]() { m_log.append(QStringLiteral("widget")); });
}

void KvImageWidgetTest::cleanup()
{
    m_widget.reset();
    m_cfg.reset();
    m_context.reset();
    StatReportTest::cleanup();
}

void KvImageWidgetTest::declaresSlotsInOrder()
{
    QCOMPARE(ownMethods(KvImageWidget::staticMetaObject, QMetaMethod::Slot),
             QStringList({"slotWidthChanged(int)", "slotAlignmentChanged(Qt::Alignment)",
                          "slotImagePathChanged(QString,QPixmap)", "slotRotateAngleChanged(int)"}));
}

void KvImageWidgetTest::isOnePiece()
{
    QCOMPARE(m_widget->displayName(), QStringLiteral("Image View"));
    QCOMPARE(m_widget->subWidgetCount(), 1);
    QCOMPARE(m_widget->subWidgetAt(0), m_widget.get());
    QVERIFY(!m_widget->subWidgetAt(1));
    QVERIFY(!m_widget->subWidgetAt(-1));
}

void KvImageWidgetTest::hasItsSizePolicy()
{
    QCOMPARE(m_widget->sizePolicy().horizontalPolicy(), QSizePolicy::Expanding);
    QCOMPARE(m_widget->sizePolicy().verticalPolicy(), QSizePolicy::Minimum);
}

void KvImageWidgetTest::hintFollowsPictureAndPage_data()
{
    QTest::addColumn<QSize>("picture");
    QTest::addColumn<int>("percent");
    QTest::addColumn<int>("rotation");
    QTest::addColumn<int>("height");
    QTest::newRow("as wide as the page") << QSize(400, 200) << 100 << 0 << 380;
    QTest::newRow("half") << QSize(400, 200) << 50 << 0 << 190;
    QTest::newRow("a quarter turn") << QSize(400, 200) << 50 << 90 << 760;
    QTest::newRow("half a turn") << QSize(400, 200) << 50 << 180 << 190;
    QTest::newRow("three quarter turns") << QSize(400, 200) << 50 << 270 << 760;
    QTest::newRow("very tall") << QSize(10, 1000) << 75 << 0 << 1302;
    QTest::newRow("made tall by turning") << QSize(1000, 10) << 75 << 90 << 1302;
    QTest::newRow("flat") << QSize(1000, 1) << 75 << 0 << 20;
    QTest::newRow("tiny share") << QSize(400, 200) << 1 << 0 << 20;
    QTest::newRow("enlarged") << QSize(2, 1) << 100 << 0 << 380;
    QTest::newRow("no share at all") << QSize(400, 200) << 0 << 0 << 20;
    QTest::newRow("an eighth turn has room, too") << QSize(400, 200) << 100 << 45 << 760;
}

void KvImageWidgetTest::hintFollowsPictureAndPage()
{
    QFETCH(QSize, picture);
    QFETCH(int, percent);
    QFETCH(int, rotation);
    QFETCH(int, height);
    m_cfg->setImage(QString(), plain(picture));
    m_cfg->setPlacement({Qt::AlignLeft, percent, rotation});
    QCOMPARE(m_widget->sizeHint().width(), 760);
    QVERIFY2(qAbs(m_widget->sizeHint().height() - height) <= 1,
             qPrintable(QString::number(m_widget->sizeHint().height())));
}

void KvImageWidgetTest::hintOfAPlaceholder()
{
    m_cfg->setImage(QStringLiteral("/gone.png"), QPixmap());
    for (const int percent : {1, 75, 100}) {
        m_cfg->setPlacement({Qt::AlignLeft, percent, 0});
        QCOMPARE(m_widget->sizeHint(), QSize(760, 152)); // a square of 20 %, whatever the width
    }
}

void KvImageWidgetTest::hintFollowsThePage()
{
    m_cfg->setPlacement({Qt::AlignLeft, 100, 0});
    m_context->setPageWidth(600);
    QCOMPARE(m_widget->sizeHint(), QSize(600 - 2 * 72, 228));
    m_context->setMarginWidth(0.0f);
    QCOMPARE(m_widget->sizeHint(), QSize(600, 300));
    m_context->setContentHeight(90);
    QCOMPARE(m_widget->sizeHint(), QSize(600, 90));
}

void KvImageWidgetTest::hintFollowsTheConfiguration()
{
    // As when a picture is dropped on the block: it is read anew under the widget.
    QVERIFY(m_cfg->fromJson({{"imgPath", ""},
                             {"alignment", "1"},
                             {"widthPercent", "50"},
                             {"imgData", KvImageSamples::base64(plain(QSize(10, 10)))}}));
    QCOMPARE(m_widget->sizeHint(), QSize(760, 380));
}

void KvImageWidgetTest::hintWithoutAPage()
{
    KvImageNodeCfg cfg(nullptr);
    cfg.setImage(QString(), plain(QSize(400, 200)));
    KvImageWidget widget(nullptr, &cfg);
    widget.resize(400, 300);
    QCOMPARE(widget.sizeHint(), QSize(400, 150));
}

void KvImageWidgetTest::survivesOddPages_data()
{
    QTest::addColumn<int>("pageWidth");
    QTest::addColumn<float>("margin");
    QTest::addColumn<int>("contentHeight");
    QTest::addColumn<QSize>("hint");
    QTest::newRow("no width") << 0 << 0.12f << 1302 << QSize(0, 20);
    QTest::newRow("less than none") << -5 << 0.12f << 1302 << QSize(0, 20);
    QTest::newRow("nothing but margins") << 1000 << 0.5f << 1302 << QSize(0, 20);
    QTest::newRow("no height") << 1000 << 0.12f << 0 << QSize(760, 20);
    QTest::newRow("less height than none") << 1000 << 0.12f << -300 << QSize(760, 20);
    QTest::newRow("widest") << 2147483647 << 0.0f << 1302 << QSize(32767, 1302);
}

void KvImageWidgetTest::survivesOddPages()
{
    QFETCH(int, pageWidth);
    QFETCH(float, margin);
    QFETCH(int, contentHeight);
    m_context->setPageWidth(pageWidth);
    m_context->setMarginWidth(margin);
    m_context->setContentHeight(contentHeight);
    QTEST(m_widget->sizeHint(), "hint");
    painted(m_widget.get(), QSize(50, 20));
}

void KvImageWidgetTest::paintsWhereItShould_data()
{
    QTest::addColumn<int>("alignment");
    QTest::addColumn<int>("percent");
    QTest::addColumn<int>("rotation");
    QTest::addColumn<QRect>("area");
    QTest::newRow("left") << 1 << 50 << 0 << QRect(0, 0, 380, 190);
    QTest::newRow("centred") << 132 << 50 << 0 << QRect(190, 0, 380, 190);
    QTest::newRow("right") << 2 << 50 << 0 << QRect(380, 0, 380, 190);
    QTest::newRow("all of the width") << 2 << 100 << 0 << QRect(0, 0, 760, 380);
    QTest::newRow("turned, left") << 1 << 20 << 90 << QRect(0, 0, 152, 304);
    QTest::newRow("turned, right") << 2 << 20 << 270 << QRect(608, 0, 152, 304);
    QTest::newRow("upside down") << 132 << 50 << 180 << QRect(190, 0, 380, 190);
}

void KvImageWidgetTest::paintsWhereItShould()
{
    QFETCH(int, alignment);
    QFETCH(int, percent);
    QFETCH(int, rotation);
    QFETCH(QRect, area);
    m_cfg->setPlacement({Qt::Alignment(alignment), percent, rotation});
    const QSize size = m_widget->sizeHint();
    QCOMPARE(size.height(), area.height());
    QCOMPARE(areaOf(painted(m_widget.get(), size), Qt::red), area);
}

void KvImageWidgetTest::paintsThePlaceholder()
{
    m_cfg->setImage(QStringLiteral("/gone.png"), QPixmap());
    m_cfg->setPlacement({Qt::AlignRight, 100, 0});
    const QImage image = painted(m_widget.get(), m_widget->sizeHint());
    QRect drawn;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            if (qGray(image.pixel(x, y)) < 200)
                drawn |= QRect(x, y, 1, 1);
        }
    }
    QVERIFY(drawn.width() > 76 && drawn.height() > 76); // seen on white paper
    QVERIFY(QRect(608, 0, 152, 152).contains(drawn));
}

void KvImageWidgetTest::turnsThePicture_data()
{
    QTest::addColumn<int>("rotation");
    QTest::addColumn<QPoint>("corner");
    QTest::newRow("0") << 0 << QPoint(0, 0);
    QTest::newRow("90") << 90 << QPoint(1, 0);
    QTest::newRow("180") << 180 << QPoint(1, 1);
    QTest::newRow("270") << 270 << QPoint(0, 1);
}

void KvImageWidgetTest::turnsThePicture()
{
    QFETCH(int, rotation);
    QFETCH(QPoint, corner);
    QPixmap picture = plain(QSize(100, 100));
    QPainter(&picture).fillRect(0, 0, 50, 50, Qt::blue);
    m_cfg->setImage(QString(), picture);
    m_cfg->setPlacement({Qt::AlignLeft, 50, rotation});
    const QRect blue = areaOf(painted(m_widget.get(), m_widget->sizeHint()), Qt::blue);
    QVERIFY(qAbs(blue.width() - 190) <= 2 && qAbs(blue.height() - 190) <= 2);
    QVERIFY(qAbs(blue.x() - corner.x() * 190) <= 2);
    QVERIFY(qAbs(blue.y() - corner.y() * 190) <= 2);
}

void KvImageWidgetTest::shrinksSmoothly()
{
    // Columns of black and white, eight to a pixel of the block: all of them together are grey.
    QPixmap stripes = plain(QSize(760 * 8, 80), Qt::white);
    QPainter painter(&stripes);
    for (int x = 0; x < stripes.width(); x += 2)
        painter.fillRect(x, 0, 1, stripes.height(), Qt::black);
    painter.end();
    m_cfg->setImage(QString(), stripes);
    m_cfg->setPlacement({Qt::AlignLeft, 100, 0});
    const QImage image = painted(m_widget.get(), QSize(760, 20));
    for (int x = 1; x < 759; ++x)
        QVERIFY2(qAbs(qGray(image.pixel(x, 5)) - 127) < 20, qPrintable(QString::number(x)));
}

void KvImageWidgetTest::paintsTheNewPicture()
{
    m_cfg->setPlacement({Qt::AlignLeft, 50, 0});
    painted(m_widget.get(), QSize(760, 190));
    m_widget->slotImagePathChanged(QStringLiteral("/b.png"), plain(QSize(400, 200), Qt::blue));
    const QImage image = painted(m_widget.get(), QSize(760, 190));
    QCOMPARE(areaOf(image, Qt::blue), QRect(0, 0, 380, 190));
    QVERIFY(areaOf(image, Qt::red).isNull());
}

void KvImageWidgetTest::slotsAnnounceEveryCall_data()
{
    QTest::addColumn<int>("slot");
    QTest::newRow("width") << 0;
    QTest::newRow("alignment") << 1;
    QTest::newRow("picture") << 2;
    QTest::newRow("rotation") << 3;
}

void KvImageWidgetTest::slotsAnnounceEveryCall()
{
    QFETCH(int, slot);
    QSignalSpy config(m_widget->displaySignals(),
                      SIGNAL(signalWidgetConfigChanged(const KvBaseEditorNodeCfg*)));
    const QPixmap picture = plain(QSize(3, 3));
    for (int i = 1; i <= 2; ++i) { // also when it is the same value again
        if (slot == 0)
            m_widget->slotWidthChanged(33);
        else if (slot == 1)
            m_widget->slotAlignmentChanged(Qt::AlignRight);
        else if (slot == 2)
            m_widget->slotImagePathChanged(QStringLiteral("/b.png"), picture);
        else
            m_widget->slotRotateAngleChanged(90);
        QCOMPARE(config.count(), i);
        QCOMPARE(configArgument(config, i - 1), m_cfg.get());
    }
    QCOMPARE(m_log, QStringList({"config", "modified", "widget", "config", "modified", "widget"}));
    QCOMPARE(m_cfg->placement().widthPercent, slot == 0 ? 33 : 75);
    QCOMPARE(int(m_cfg->placement().alignment), slot == 1 ? 2 : 132);
    QCOMPARE(m_cfg->imagePath(), slot == 2 ? QStringLiteral("/b.png") : QStringLiteral("/a.png"));
    QCOMPARE(m_cfg->placement().rotation, slot == 3 ? 90 : 0);
}

void KvImageWidgetTest::announcesInOrder()
{
    // Whoever lays out on the last signal finds the new size.
    QSize hint;
    connect(m_widget->displaySignals(), &KvBaseDisplayWidgetSignals::signalWidgetChanged, this,
            [&]() { hint = m_widget->sizeHint(); });
    m_widget->slotWidthChanged(50);
    QCOMPARE(hint, QSize(760, 190));
    m_widget->slotRotateAngleChanged(90);
    QCOMPARE(hint, QSize(760, 760));
    QCOMPARE(m_log, QStringList({"config", "modified", "widget", "config", "modified", "widget"}));
}

void KvImageWidgetTest::everyWidthIsKept()
{
    for (int percent = 1; percent <= 100; ++percent) {
        m_widget->slotWidthChanged(percent);
        QCOMPARE(m_cfg->placement().widthPercent, percent);
        QJsonObject config;
        QVERIFY(m_cfg->toJson(config));
        QCOMPARE(config.value("widthPercent"), QJsonValue(QString::number(percent)));
    }
}

void KvImageWidgetTest::aPictureIsTaken()
{
    m_widget->slotImagePathChanged(QStringLiteral("/b.png"), plain(QSize(10, 10), Qt::blue));
    QCOMPARE(m_cfg->image().size(), QSize(10, 10));
    m_widget->slotImagePathChanged(QStringLiteral("/gone.png"), QPixmap());
    QVERIFY(m_cfg->image().isNull());
    QCOMPARE(m_cfg->imagePath(), QStringLiteral("/gone.png"));
    QCOMPARE(m_widget->sizeHint(), QSize(760, 152));
}

void KvImageWidgetTest::worksWithoutAContext()
{
    KvImageNodeCfg cfg(nullptr);
    KvImageWidget widget(nullptr, &cfg);
    QSignalSpy changed(widget.displaySignals(), SIGNAL(signalWidgetChanged()));
    widget.slotWidthChanged(5);
    QCOMPARE(changed.count(), 1);
    painted(&widget, QSize(100, 100));
}

void KvImageWidgetTest::panelIsConnected()
{
    QWidget parent;
    QWidget *panel = m_widget->createOptionsWidget(&parent, true);
    QCOMPARE(panel->parentWidget(), &parent);
    QVERIFY(qobject_cast<KvImageNodeOptionsWidget *>(panel));
    QCOMPARE(m_log, QStringList()); // filled without a word
    parent.show();
    panel->findChild<QSpinBox *>()->setValue(44);
    QCOMPARE(m_cfg->placement().widthPercent, 44);
    panel->findChild<QComboBox *>()->setCurrentIndex(3);
    QCOMPARE(m_cfg->placement().rotation, 270);
    PanelProbe::click(PanelProbe::controls<QPushButton>(panel).at(2));
    QCOMPARE(int(m_cfg->placement().alignment), 2);
    const QPixmap picture = plain(QSize(6, 6));
    emit qobject_cast<KvImageNodeOptionsWidget *>(panel)->signalImagePathChanged(QStringLiteral("/c.png"),
                                                                                 picture);
    QCOMPARE(m_cfg->imagePath(), QStringLiteral("/c.png"));
    QCOMPARE(m_log.count(QStringLiteral("config")), 4);
    m_widget.reset(); // the panel may stay longer
    panel->findChild<QSpinBox *>()->setValue(45);
    QCOMPARE(m_cfg->placement().widthPercent, 44);
}

void KvImageWidgetTest::panelWithoutPlacement()
{
    const std::unique_ptr<QWidget> panel(m_widget->createOptionsWidget(nullptr, false));
    QVERIFY(!panel->findChild<QSpinBox *>());
    QVERIFY(panel->findChild<QComboBox *>());
}

STATREPORT_TEST_MAIN(KvImageWidgetTest)
#include "KvImageWidgetTest.moc"

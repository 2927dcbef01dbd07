// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "editor/KvEditorToolWidget.h"
#include "gui/acss.h"
#include "templates/FakeBlockFactory.h"
#include "templates/KvTemplateContext.h"

#include <QDataStream>
#include <QMimeData>
#include <QPointer>

#include <memory>

namespace {

const QString name = QStringLiteral("Fake block");
const QString title = QStringLiteral("A block that does not exist");

QString iconFile()
{
    return StatReportTest::sourcePath(QStringLiteral("tests/host/resources/test-block.svg"));
}

} // namespace

class KvBaseEditorNodeFactoryTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void hasNameAndTitle();
    void theIconIsAToolIcon();
    void createsConfigurations();
    void theToolWidgetIsMadeOnce();
    void theToolWidgetShowsTheBlockType();
    void theToolWidgetMayDieWithItsParent();
    void theDragPictureShowsTheToolWidget();
    void theDragPictureIsGrabbedOnce();
    void theDragPictureNeedsNoPalette();
    void dragDataCarriesTheName_data();
    void dragDataCarriesTheName();
    void dragDataIsNewEachTime();
};

void KvBaseEditorNodeFactoryTest::hasNameAndTitle()
{
    const FakeBlockFactory factory(name, title);
    QCOMPARE(factory.name(), name);
    QCOMPARE(factory.title(), title);
}

void KvBaseEditorNodeFactoryTest::theIconIsAToolIcon()
{
    const FakeBlockFactory factory(name, title, iconFile());
    QVERIFY(!factory.icon().isNull());
    QCOMPARE(factory.icon().availableSizes(), QList<QSize>({QSize(24, 24)}));
    const QIcon expected = acss::createIcon(6, iconFile(), QSize(24, 24));
    QCOMPARE(factory.icon().pixmap(24, 24).toImage(), expected.pixmap(24, 24).toImage());
}

void KvBaseEditorNodeFactoryTest::createsConfigurations()
{
    KvTemplateContext context(nullptr);
    FakeBlockFactory factory(name);
    const std::unique_ptr<KvBaseEditorNodeCfg> one(factory.createConfig(&context));
    const std::unique_ptr<KvBaseEditorNodeCfg> other(factory.createConfig(&context));
    QCOMPARE(one->context(), &context);
    QVERIFY(one != other);
}

void KvBaseEditorNodeFactoryTest::theToolWidgetIsMadeOnce()
{
    FakeBlockFactory factory(name, title);
    QWidget palette;
    QWidget otherParent;
    QVERIFY(palette.findChildren<KvEditorToolWidget *>().isEmpty());
    KvEditorToolWidget *widget = factory.toolWidget(&palette);
    QVERIFY(widget != nullptr);
    QCOMPARE(widget->parentWidget(), &palette);
    QCOMPARE(factory.toolWidget(&palette), widget);
    QCOMPARE(factory.toolWidget(&otherParent), widget);
    QCOMPARE(factory.toolWidget(nullptr), widget);
    QCOMPARE(widget->parentWidget(), &palette);
    QCOMPARE(palette.findChildren<KvEditorToolWidget *>().size(), 1);
}

void KvBaseEditorNodeFactoryTest::theToolWidgetShowsTheBlockType()
{
    FakeBlockFactory factory(name, title, iconFile());
    QWidget palette;
    KvEditorToolWidget *widget = factory.toolWidget(&palette);
    QCOMPARE(widget->factory(), &factory);
    QCOMPARE(widget->text(), title);
    const QImage icon = factory.icon().pixmap(24, 24).toImage();
    int labelsWithIcon = 0;
    for (const QLabel *label : widget->findChildren<QLabel *>()) {
        if (label->pixmap(Qt::ReturnByValue).toImage() == icon)
            ++labelsWithIcon;
    }
    QCOMPARE(labelsWithIcon, 1);
}

void KvBaseEditorNodeFactoryTest::theToolWidgetMayDieWithItsParent()
{
    FakeBlockFactory factory(name, title);
    auto palette = std::make_unique<QWidget>();
    const QPointer<KvEditorToolWidget> first = factory.toolWidget(palette.get());
    palette.reset();
    QVERIFY(first.isNull());
    QWidget next;
    KvEditorToolWidget *second = factory.toolWidget(&next);
    QVERIFY(second != nullptr);
    QCOMPARE(second->parentWidget(), &next);
    QCOMPARE(second->text(), title);
}

void KvBaseEditorNodeFactoryTest::theDragPictureShowsTheToolWidget()
{
    FakeBlockFactory factory(name, title);
    QWidget palette;
    KvEditorToolWidget *widget = factory.toolWidget(&palette);
    widget->resize(210, 36);
    const QPixmap picture = factory.dragPixmap();
    QCOMPARE(picture.size(), QSize(210, 36) * widget->devicePixelRatio());
    QCOMPARE(picture.toImage(), widget->grab().toImage());
    // It shows the title, so it is not of one colour.
    const QImage image = picture.toImage();
    QImage plain(image.size(), image.format());
    plain.fill(image.pixelColor(0, 0));
    QVERIFY(image != plain);
}

void KvBaseEditorNodeFactoryTest::theDragPictureIsGrabbedOnce()
{
    FakeBlockFactory factory(name, title);
    QWidget palette;
    factory.toolWidget(&palette)->resize(210, 36);
    const QPixmap first = factory.dragPixmap();
    factory.toolWidget(&palette)->resize(300, 50);
    const QPixmap second = factory.dragPixmap();
    QCOMPARE(second.cacheKey(), first.cacheKey());
    QCOMPARE(second.size(), first.size());
}

void KvBaseEditorNodeFactoryTest::theDragPictureNeedsNoPalette()
{
    QPointer<KvEditorToolWidget> widget;
    {
        FakeBlockFactory factory(name, title);
        QVERIFY(!factory.dragPixmap().isNull());
        widget = factory.toolWidget(nullptr);
        QVERIFY(!widget.isNull());
    }
    // A tool widget that nobody took ends with its factory.
    QVERIFY(widget.isNull());
}

void KvBaseEditorNodeFactoryTest::dragDataCarriesTheName_data()
{
    QTest::addColumn<QString>("typeName");
    QTest::newRow("plain") << QStringLiteral("Text Document");
    QTest::newRow("other scripts") << QStringLiteral("Größe Ω 表");
    QTest::newRow("empty") << QString();
}

void KvBaseEditorNodeFactoryTest::dragDataCarriesTheName()
{
    QFETCH(QString, typeName);
    const FakeBlockFactory factory(typeName, title);
    const std::unique_ptr<QMimeData> data(factory.mimeData());
    const QString format = QStringLiteral("application/x-KvEditorToolsListModeldatalist");
    QCOMPARE(data->formats(), QStringList(format));
    QByteArray expected;
    QDataStream out(&expected, QIODevice::WriteOnly);
    out << QStringLiteral("nodeType") << typeName;
    QCOMPARE(data->data(format), expected);
    QCOMPARE(QString::fromLatin1(KvBaseEditorNodeFactory::MimeFormat), format);

    QDataStream in(data->data(format));
    QString tag;
    QString read;
    in >> tag >> read;
    QCOMPARE(tag, QStringLiteral("nodeType"));
    QCOMPARE(read, typeName);
    QVERIFY(in.atEnd());
    QCOMPARE(in.status(), QDataStream::Ok);
}

void KvBaseEditorNodeFactoryTest::dragDataIsNewEachTime()
{
    const FakeBlockFactory factory(name, title);
    const std::unique_ptr<QMimeData> first(factory.mimeData());
    const std::unique_ptr<QMimeData> second(factory.mimeData());
    QVERIFY(first != second);
}

STATREPORT_TEST_MAIN(KvBaseEditorNodeFactoryTest)
#include "KvBaseEditorNodeFactoryTest.moc"

// SPDX-License-Identifier: MIT
#include "KvDeskObjectClipboard.h"

#include "KvDeskObjectId.h"
#include "host/measuring/Polygon.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtMeasuredObjectData.h"
#include "measuring/ZtMeasuringDocument.h"
#include "measuring/ZtMeasuringManipulator.h"
#include "measuring/ZtSession.h"
#include "support/StatReportTest.h"

#include <QBuffer>
#include <QMimeData>

class KvDeskObjectClipboardTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void cleanup();

    void drawnObjectsComeBack();
    void valuesAreATable();
    void objectsWithoutValuesHaveARow();
    void namesCannotBreakTheTable();
    void hiddenValuesAreLeftOut();
    void importedObjectsAreValuesOnly();
    void goneObjectsAreLeftOut();
    void otherDataHaveNoObjects_data();
    void otherDataHaveNoObjects();

private:
    KvDeskObjectId add(int type, const QPolygonF &points, const QString &name = QString(),
                       const QString &text = QString())
    {
        return {type, m_document.addObject(type, points, name, text)};
    }
    static QVector<QStringList> table(const QMimeData &data)
    {
        QVector<QStringList> rows;
        for (const QString &line : data.text().split(QLatin1Char('\n'), Qt::SkipEmptyParts))
            rows.append(line.split(QLatin1Char('\t')));
        return rows;
    }

    ZtMeasuringDocument m_document;
};

void KvDeskObjectClipboardTest::cleanup()
{
    m_document.clear();
    StatReportTest::cleanup();
}

void KvDeskObjectClipboardTest::drawnObjectsComeBack()
{
    const KvDeskObjectId line =
        add(ZtDrawnType::Line, polygon({{1, 2}, {3.5, 4.25}}), QStringLiteral("Edge"));
    const KvDeskObjectId note =
        add(ZtDrawnType::TextNote, polygon({{5, 6}}), QString(), QStringLiteral("a\tb \u00b5\n2"));
    const std::unique_ptr<QMimeData> data = KvDeskObjectClipboard::toMimeData({note, line});
    QVERIFY(KvDeskObjectClipboard::hasObjects(data.get()));
    const QVector<ZtSessionObject> objects = KvDeskObjectClipboard::objects(data.get());
    // In the order in which they are drawn.
    QCOMPARE(objects.size(), 2);
    QCOMPARE(objects.at(0).type->id, static_cast<int>(ZtDrawnType::Line));
    QCOMPARE(objects.at(0).name, QStringLiteral("Edge"));
    QCOMPARE(objects.at(0).points, polygon({{1, 2}, {3.5, 4.25}}));
    QCOMPARE(objects.at(1).type->id, static_cast<int>(ZtDrawnType::TextNote));
    QCOMPARE(objects.at(1).text, QStringLiteral("a\tb \u00b5\n2"));
    QCOMPARE(objects.at(1).name, QString());
}

void KvDeskObjectClipboardTest::valuesAreATable()
{
    const KvDeskObjectId line = add(ZtDrawnType::Line, polygon({{0, 0}, {3, 4}}));
    const KvDeskObjectId rectangle = add(ZtDrawnType::Rectangle, polygon({{0, 0}, {3, 4}}));
    const QVector<QStringList> rows = table(*KvDeskObjectClipboard::toMimeData({line, rectangle}));
    QCOMPARE(rows.size(), 5);
    QCOMPARE(rows.at(0), QStringList({QStringLiteral("Type"), QStringLiteral("Object"),
                                      QStringLiteral("Value name"), QStringLiteral("Value")}));
    QCOMPARE(rows.at(1).mid(0, 3), QStringList({QStringLiteral("Rectangle"), QStringLiteral("Rectangle 1"),
                                                QStringLiteral("Width")}));
    QCOMPARE(rows.at(2).at(2), QStringLiteral("Height"));
    QCOMPARE(rows.at(3).at(2), QStringLiteral("Area"));
    QCOMPARE(rows.at(4), QStringList({QStringLiteral("Line"), QStringLiteral("Line 1"),
                                      QStringLiteral("Length"), QStringLiteral("5.0 px")}));
}

void KvDeskObjectClipboardTest::objectsWithoutValuesHaveARow()
{
    const KvDeskObjectId note = add(ZtDrawnType::TextNote, polygon({{5, 6}}), QString(), QStringLiteral("x"));
    const QVector<QStringList> rows = table(*KvDeskObjectClipboard::toMimeData({note}));
    QCOMPARE(rows.size(), 2);
    QCOMPARE(rows.at(1),
             QStringList({QStringLiteral("Text note"), QStringLiteral("Text note 1"), QString(), QString()}));
}

void KvDeskObjectClipboardTest::namesCannotBreakTheTable()
{
    const KvDeskObjectId line =
        add(ZtDrawnType::Line, polygon({{0, 0}, {3, 4}}), QStringLiteral("left\tor\nright"));
    const QVector<QStringList> rows = table(*KvDeskObjectClipboard::toMimeData({line}));
    QCOMPARE(rows.size(), 2);
    QCOMPARE(rows.at(1).size(), 4);
    QCOMPARE(rows.at(1).at(1), QStringLiteral("left or right"));
}

void KvDeskObjectClipboardTest::hiddenValuesAreLeftOut()
{
    const KvDeskObjectId rectangle = add(ZtDrawnType::Rectangle, polygon({{0, 0}, {3, 4}}));
    ZtKernelData *const kernel = ZtKernelData::getInstance();
    auto *const manipulator = static_cast<ZtMeasuringManipulator *>(kernel->getGsManipulator(rectangle.type));
    auto *const object = static_cast<ZtMeasuredObjectData *>(kernel->object(rectangle.type, rectangle.id));
    manipulator->setValueShown(object, 1, false);
    const std::unique_ptr<QMimeData> data = KvDeskObjectClipboard::toMimeData({rectangle});
    QCOMPARE(table(*data).size(), 3);
    QVERIFY(!data->text().contains(QStringLiteral("Height")));
    QCOMPARE(KvDeskObjectClipboard::objects(data.get()).first().hiddenValues, QVector<int>{1});
}

void KvDeskObjectClipboardTest::importedObjectsAreValuesOnly()
{
    QBuffer file;
    file.setData("name;width\nA;1,5\nB;2,5\n");
    QVERIFY(file.open(QIODevice::ReadOnly));
    ZtFault fault;
    QVERIFY2(m_document.importTable(&file, QStringLiteral("t.csv"), ZtTableImportOptions(), &fault),
             qPrintable(fault.text()));
    const int type = m_document.importedTypes().first();
    const std::unique_ptr<QMimeData> alone = KvDeskObjectClipboard::toMimeData({{type, 1}});
    QVERIFY(!KvDeskObjectClipboard::hasObjects(alone.get()));
    QCOMPARE(table(*alone).size(), 2);
    const KvDeskObjectId line = add(ZtDrawnType::Line, polygon({{0, 0}, {3, 4}}));
    const std::unique_ptr<QMimeData> both = KvDeskObjectClipboard::toMimeData({{type, 1}, line});
    QCOMPARE(KvDeskObjectClipboard::objects(both.get()).size(), 1);
    QCOMPARE(table(*both).size(), 3);
}

void KvDeskObjectClipboardTest::goneObjectsAreLeftOut()
{
    const std::unique_ptr<QMimeData> data = KvDeskObjectClipboard::toMimeData({{ZtDrawnType::Line, 77}});
    QVERIFY(!KvDeskObjectClipboard::hasObjects(data.get()));
    QCOMPARE(table(*data).size(), 1);
}

void KvDeskObjectClipboardTest::otherDataHaveNoObjects_data()
{
    QTest::addColumn<QByteArray>("bytes");
    const KvDeskObjectId line = add(ZtDrawnType::Line, polygon({{0, 0}, {3, 4}}));
    const QByteArray good =
        KvDeskObjectClipboard::toMimeData({line})->data(KvDeskObjectClipboard::mimeType());
    QVERIFY(good.size() > 10);
    QTest::newRow("nothing") << QByteArray();
    QTest::newRow("other bytes") << QByteArray("\0\1\2", 3);
    QTest::newRow("cut off") << good.left(good.size() / 2);
    QTest::newRow("unknown type") << QByteArray(good).replace("\"line\"", "\"spiral\"");
}

void KvDeskObjectClipboardTest::otherDataHaveNoObjects()
{
    QFETCH(QByteArray, bytes);
    QMimeData data;
    data.setData(KvDeskObjectClipboard::mimeType(), bytes);
    QVERIFY(KvDeskObjectClipboard::objects(&data).isEmpty());
    QVERIFY(KvDeskObjectClipboard::objects(nullptr).isEmpty());
    QVERIFY(!KvDeskObjectClipboard::hasObjects(nullptr));
}

STATREPORT_TEST_MAIN(KvDeskObjectClipboardTest)
#include "KvDeskObjectClipboardTest.moc"

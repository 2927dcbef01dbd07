// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "measuring/ZtTableHeader.h"

class ZtTableHeaderTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void takesHeadingsApart_data();
    void takesHeadingsApart();
    void findsColumns_data();
    void findsColumns();
    void findsKeys();
};

void ZtTableHeaderTest::takesHeadingsApart_data()
{
    QTest::addColumn<QString>("written");
    QTest::addColumn<QString>("name");
    QTest::addColumn<QString>("unit");
    QTest::newRow("plain") << "Area"
                           << "Area"
                           << "";
    QTest::newRow("underscores") << "bill_length_mm"
                                 << "bill length"
                                 << "mm";
    QTest::newRow("underscore, square") << "leaf_area_mm2"
                                        << "leaf area"
                                        << "mm2";
    QTest::newRow("underscore, micro sign")
        << QStringLiteral("size_\u00B5m") << "size" << QStringLiteral("\u00B5m");
    QTest::newRow("underscore, weight") << "body_mass_g"
                                        << "body mass"
                                        << "g";
    QTest::newRow("underscore, no unit") << "bill_length"
                                         << "bill length"
                                         << "";
    QTest::newRow("unit alone") << "_mm"
                                << "mm"
                                << "";
    QTest::newRow("unit as a name") << "mm"
                                    << "mm"
                                    << "";
    QTest::newRow("square brackets") << QStringLiteral("Area [\u00B5m\u00B2]") << "Area"
                                     << QStringLiteral("\u00B5m\u00B2");
    QTest::newRow("brackets") << "Length (mm)"
                              << "Length"
                              << "mm";
    QTest::newRow("brackets without a blank") << "Length(mm)"
                                              << "Length"
                                              << "mm";
    QTest::newRow("two pairs of brackets") << "Length (outer) (mm)"
                                           << "Length (outer)"
                                           << "mm";
    QTest::newRow("empty brackets") << "Length ()"
                                    << "Length"
                                    << "";
    QTest::newRow("brackets alone") << "(mm)"
                                    << "(mm)"
                                    << "";
    QTest::newRow("open bracket") << "Length (mm"
                                  << "Length (mm"
                                  << "";
    QTest::newRow("brackets and underscore") << "bill_length [mm]"
                                             << "bill length"
                                             << "mm";
    QTest::newRow("slash") << "Length / mm"
                           << "Length"
                           << "mm";
    QTest::newRow("slash, short unit") << "Force / N"
                                       << "Force"
                                       << "N";
    QTest::newRow("slash, compound unit") << "Speed / m/s"
                                          << "Speed"
                                          << "m/s";
    QTest::newRow("slash, micron") << "Length / microns"
                                   << "Length"
                                   << "microns";
    QTest::newRow("ratio") << "Width / Height"
                           << "Width / Height"
                           << "";
    QTest::newRow("slash without blanks") << "a/b"
                                          << "a/b"
                                          << "";
    QTest::newRow("slash at the start") << " / mm"
                                        << "/ mm"
                                        << "";
    QTest::newRow("point") << "Circ."
                           << "Circ."
                           << "";
    QTest::newRow("percent sign") << "%Area"
                                  << "%Area"
                                  << "";
    QTest::newRow("blank") << "  "
                           << ""
                           << "";
    QTest::newRow("blanks inside") << "  Petal \n length "
                                   << "Petal length"
                                   << "";
    QTest::newRow("underscores alone") << "__"
                                       << "__"
                                       << "";
    QTest::newRow("Chinese") << QStringLiteral("\u9577\u3055 [mm]") << QStringLiteral("\u9577\u3055") << "mm";
}

void ZtTableHeaderTest::takesHeadingsApart()
{
    QFETCH(QString, written);
    const ZtTableHeader header = ZtTableHeader::parse(written);
    QCOMPARE(header.written, written.simplified());
    QTEST(header.name, "name");
    QTEST(header.unitText, "unit");
}

void ZtTableHeaderTest::findsColumns_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<int>("column");
    QTest::newRow("as written") << "Area [mm2]" << 1;
    QTest::newRow("display name") << "Area" << 1;
    QTest::newRow("same letter case first") << "area" << 2;
    QTest::newRow("other letter case") << "TYPE" << 0;
    QTest::newRow("other letter case, display name") << "Bill Length" << 3;
    QTest::newRow("blanks around") << " type " << 0;
    QTest::newRow("unknown") << "Length" << -1;
}

void ZtTableHeaderTest::findsColumns()
{
    QVector<ZtTableHeader> headers;
    for (const char *written : {"type", "Area [mm2]", "area", "bill_length_mm"})
        headers.append(ZtTableHeader::parse(QLatin1String(written)));
    QFETCH(QString, name);
    QTEST(ZtTableHeader::find(headers, name), "column");
}

void ZtTableHeaderTest::findsKeys()
{
    QVector<ZtTableHeader> headers;
    for (const char *written : {"Object-Type", "Object Index", "label"})
        headers.append(ZtTableHeader::parse(QLatin1String(written)));
    const QStringList keys = {QStringLiteral("object_index"), QStringLiteral("label"),
                              QStringLiteral("object_type")};
    QCOMPARE(ZtTableHeader::findKey(headers, keys), 1);
    QCOMPARE(ZtTableHeader::findKey(headers, keys, 1), 2);
    QCOMPARE(ZtTableHeader::findKey(headers, {QStringLiteral("object_type")}), 0);
    QCOMPARE(ZtTableHeader::findKey(headers, {QStringLiteral("Label")}), -1);
}

STATREPORT_TEST_MAIN(ZtTableHeaderTest)
#include "ZtTableHeaderTest.moc"

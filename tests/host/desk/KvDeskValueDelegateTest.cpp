// SPDX-License-Identifier: MIT
#include "KvDeskValueDelegate.h"

#include "support/StatReportTest.h"

namespace {

constexpr QSize cellSize(160, 24);

QImage drawn(const QString &text, int unitWidth, bool isSelected = false)
{
    QStandardItemModel model;
    model.appendRow(new QStandardItem(text));
    KvDeskValueDelegate delegate;
    delegate.setUnitWidth(unitWidth);
    QStyleOptionViewItem option;
    option.rect = QRect(QPoint(), cellSize);
    option.palette.setColor(QPalette::Text, Qt::black);
    option.palette.setColor(QPalette::Base, Qt::white);
    option.state = QStyle::State_Enabled;
    option.state.setFlag(QStyle::State_Selected, isSelected);
    QImage image(cellSize, QImage::Format_RGB32);
    image.fill(Qt::white);
    QPainter painter(&image);
    delegate.paint(&painter, option, model.index(0, 0));
    return image;
}

// First and last column with anything drawn in it.
QPair<int, int> inked(const QImage &image)
{
    QPair<int, int> span(-1, -1);
    for (int x = 0; x < image.width(); ++x) {
        for (int y = 0; y < image.height(); ++y) {
            if (image.pixelColor(x, y) == QColor(Qt::white))
                continue;
            span.first = span.first < 0 ? x : span.first;
            span.second = x;
        }
    }
    return span;
}

} // namespace

class KvDeskValueDelegateTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void numbersEndAtOnePlace();
    void numberWithoutUnitsEndsAtTheBorder();
    void widthHoldsNumberAndUnit();
};

void KvDeskValueDelegateTest::numbersEndAtOnePlace()
{
    // Units of different widths do not shift the numbers.
    const int end = inked(drawn(QStringLiteral("12.5"), 40)).second;
    QVERIFY(end > 80);
    QVERIFY(end <= 160 - 8 - 40 - 4);
    const QImage narrow = drawn(QStringLiteral("12.5 m"), 40).copy(0, 0, end + 1, 24);
    const QImage wide = drawn(QStringLiteral("12.5 mm²"), 40).copy(0, 0, end + 1, 24);
    QCOMPARE(narrow, wide);
    QVERIFY(inked(drawn(QStringLiteral("12.5 mm²"), 40)).second > end + 4);
}

void KvDeskValueDelegateTest::numberWithoutUnitsEndsAtTheBorder()
{
    const int end = inked(drawn(QStringLiteral("12.5"), 0)).second;
    QVERIFY(end > 160 - 16);
    QVERIFY(end <= 160 - 8);
}

void KvDeskValueDelegateTest::widthHoldsNumberAndUnit()
{
    KvDeskValueDelegate delegate;
    QCOMPARE(delegate.widthFor(50), 50 + 16);
    delegate.setUnitWidth(30);
    QCOMPARE(delegate.widthFor(50), 50 + 4 + 30 + 16);
}

STATREPORT_TEST_MAIN(KvDeskValueDelegateTest)
#include "KvDeskValueDelegateTest.moc"

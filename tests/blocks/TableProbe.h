// SPDX-License-Identifier: MIT
#pragma once

#include "blocks/table/KvStatisticSubTable.h"
#include "blocks/table/KvStatisticsBaseTableWidgetModel.h"

#include <QAbstractItemModel>
#include <QImage>
#include <QStringList>
#include <QVBoxLayout>
#include <QWidget>

/** Looks at what table pieces show, in numbers and in pixels. */
namespace TableProbe {

/** Texts of a row; "-" where there is no cell. */
inline QStringList rowTexts(const QAbstractItemModel &model, int row)
{
    QStringList texts;
    for (int column = 0; column < model.columnCount(); ++column) {
        const QVariant text = model.index(row, column).data();
        texts.append(text.isValid() ? text.toString() : QStringLiteral("-"));
    }
    return texts;
}

inline QList<QStringList> allTexts(const QAbstractItemModel &model)
{
    QList<QStringList> rows;
    for (int row = 0; row < model.rowCount(); ++row)
        rows.append(rowTexts(model, row));
    return rows;
}

inline KvStatisticSubTable *piece(QWidget *widget)
{
    return qobject_cast<KvStatisticSubTable *>(widget);
}

/** The picture of a piece that stands on a white page between margins, as pages put it there. */
inline QImage pagePicture(QWidget *piece, bool styled)
{
    QWidget page;
    QVBoxLayout layout(&page);
    layout.setContentsMargins(8, 8, 8, 8);
    if (styled) {
        page.setStyleSheet(QStringLiteral("QWidget { background: white; }"));
        piece->setStyleSheet(QStringLiteral("QWidget { background: white; color: black;}"));
    } else {
        QPalette palette = page.palette();
        palette.setColor(QPalette::Window, Qt::white);
        page.setPalette(palette);
    }
    layout.addWidget(piece);
    piece->show();
    page.ensurePolished();
    layout.activate();
    page.resize(page.sizeHint());
    const QImage image = page.grab().toImage().convertToFormat(QImage::Format_RGB32);
    piece->setParent(nullptr);
    return image;
}

} // namespace TableProbe

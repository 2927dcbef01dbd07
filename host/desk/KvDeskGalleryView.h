// SPDX-License-Identifier: MIT
#pragma once

#include <QListView>

/**
 * Thumbnails to look at, to choose and to drag away.
 *
 * Enter or a double click opens a picture, Del wants the selected ones gone.
 */
class KvDeskGalleryView : public QListView
{
    Q_OBJECT
public:
    explicit KvDeskGalleryView(QWidget *parent = nullptr);

    /** The selected rows, from the first to the last. */
    QModelIndexList selectedRows() const;
    /** What a drag takes along: the current picture first, as some receivers take one only. */
    QModelIndexList draggedRows() const;
    /** What the pointer shows of a drag. */
    QPixmap dragPixmap(const QModelIndexList &indexes) const;

signals:
    void signalOpenRequested(QModelIndex aIndex);
    void signalRemoveRequested();

protected:
    void startDrag(Qt::DropActions supportedActions) override;
    void keyPressEvent(QKeyEvent *event) override;
    void mouseDoubleClickEvent(QMouseEvent *event) override;
    bool event(QEvent *event) override;

private slots:
    void slotThemeChanged();
};

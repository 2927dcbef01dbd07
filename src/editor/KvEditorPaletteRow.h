// SPDX-License-Identifier: MIT
#pragma once

#include <QFrame>
#include <QIcon>
#include <QSize>
#include <QString>

class QLabel;

/** Row of the editor's palette: icon, name and a mark at the right. A click, Space or Enter activates it. */
class KvEditorPaletteRow : public QFrame
{
    Q_OBJECT
public:
    explicit KvEditorPaletteRow(QWidget *parent = nullptr);

    QString text() const;
    /** Also the row's accessible name. */
    void setText(const QString &text);
    QIcon icon() const { return m_icon; }
    void setIcon(const QIcon &icon);
    /** The picture at the right, an icon path as for acss::getPathSVG(). */
    QString markPath() const { return m_markPath; }
    void setMark(const QString &iconPath, const QSize &size);

signals:
    void signalActivated();

protected:
    virtual void activate();

    void paintEvent(QPaintEvent *event) override;
    void keyPressEvent(QKeyEvent *event) override;
    void mousePressEvent(QMouseEvent *event) override;
    void mouseReleaseEvent(QMouseEvent *event) override;

private slots:
    void slotDrawIcons();

private:
    QLabel *m_iconLabel;
    QLabel *m_nameLabel;
    QLabel *m_markLabel;
    QIcon m_icon;
    QString m_markPath;
    QSize m_markSize;
};

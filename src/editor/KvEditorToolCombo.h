// SPDX-License-Identifier: MIT
#pragma once

#include <QFrame>
#include <QString>

class KvEditorPaletteRow;
class QVBoxLayout;

/** Collapsible group of the palette: a header with icon, name and arrow, and tools that it shows and hides.
 */
class KvEditorToolCombo : public QFrame
{
    Q_OBJECT
public:
    /** \a iconPath as for acss::getPathSVG(). The group starts closed. */
    KvEditorToolCombo(const QString &title, const QString &iconPath, QWidget *parent = nullptr);

    QString title() const;
    bool isOpen() const { return m_isOpen; }
    void setOpen(bool open);
    /** Appends \a tool to the contents, which take it over. */
    void addTool(QWidget *tool);

protected:
    void changeEvent(QEvent *event) override;

private slots:
    void slotHeaderActivated();

private:
    void updateHeader();

    KvEditorPaletteRow *m_header;
    QFrame *m_contentsFrame;
    QVBoxLayout *m_contents;
    bool m_isOpen = false;
};

// SPDX-License-Identifier: MIT
#pragma once

#include <QWidget>

class KvDeskPanelHeader;

/** Base of the panels around the image: a header, and below it the panel's own widget. */
class KvDeskPanel : public QWidget
{
    Q_OBJECT
public:
    /** \a closeTip is the tool tip of the button that closes the panel. */
    KvDeskPanel(const QString &title, const QString &closeTip, QWidget *parent);

    KvDeskPanelHeader *header() const { return m_header; }

signals:
    void signalCloseClicked(); ///< the user does not want to see the panel

protected:
    /** Puts the panel's own widget below the header; called once. */
    void setContent(QWidget *content);

private:
    KvDeskPanelHeader *m_header;
};

// SPDX-License-Identifier: MIT
#pragma once

#include "blocks/textdocument/KvTextDocumentNodeWidget.h"

class KvPageSectionsCfg;

/** Common base of header and footer: a text that spans the page and follows the template's changes. */
class KvPageSectionWidget : public KvTextDocumentNodeWidget
{
    Q_OBJECT
public:
    /** \a section is not owned and outlives the widget. */
    KvPageSectionWidget(QWidget *displayParent, KvPageSectionsCfg *section);

    /** Makes the widget \a width pixels wide and as high as its text needs then. */
    void fitToWidth(int width);

public slots:
    /** Shows the section with the current keyword values, unless it is edited in this widget. */
    void slotTemplateModified();

protected:
    void applyContent(Change change) override;
    void resizeEvent(QResizeEvent *event) override;

private slots:
    void slotAnnounceSize();

private:
    bool m_updating = false;
    bool m_sizeUnannounced = false; ///< the text has another height than it was measured with
};

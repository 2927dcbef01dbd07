// SPDX-License-Identifier: MIT
#pragma once

#include "report/KvBaseDisplayWidget.h"

#include <QTextEdit>

class KvTextDocumentNodeCfg;

/**
 * Display widget of a text block: a rich-text view as wide as the page's content and as high as its text.
 *
 * The configuration keeps keywords as placeholders; what is shown has them expanded.
 */
class KvTextDocumentNodeWidget
    : public QTextEdit
    , public KvBaseDisplayWidget
{
    Q_OBJECT
public:
    /** \a cfg is not owned and outlives the widget. */
    KvTextDocumentNodeWidget(QWidget *parent, KvTextDocumentNodeCfg *cfg);

    QString displayName() const override;
    /** The widget itself, fitted to the context's current page width. */
    QWidget *subWidgetAt(int index) override;
    QWidget *createOptionsWidget(QWidget *parent, bool withPlacement) override;

    QSize sizeHint() const override;
    QSize minimumSizeHint() const override;

    /** Shows the configuration's text with keywords expanded; never counts as an edit. */
    void refreshText();

public slots:
    void slotTextChanged();

protected:
    /**
     * Takes the text over into the configuration after an edit, announces it and marks the template modified,
     * whether the stored text changed or not: a deliberately coarse rule.
     */
    virtual void applyContent();

    void showEvent(QShowEvent *event) override;

    KvTextDocumentNodeCfg *cfg() const { return m_cfg; }

private:
    void applyPageWidth();
    void updateHeight();
    int documentHeight() const;

    KvTextDocumentNodeCfg *m_cfg;
};

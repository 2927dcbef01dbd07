// SPDX-License-Identifier: MIT
#pragma once

#include "report/KvBaseDisplayWidget.h"

#include <QKeySequence>
#include <QPointer>
#include <QTextEdit>

class KvTextDocumentNodeCfg;
class KvTextDocumentNodeOptionsWidget;

/**
 * Display widget of a text block: a rich-text view as wide as the page's content and as high as its text.
 *
 * The configuration keeps keywords as placeholders. What is shown, and printed, has them expanded, but for
 * the time in which the text is edited: as long as its options panel is open. Only then does it take focus,
 * mouse and keys.
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
    /**
     * Opens the text for editing until the panel is deleted. A former panel that is still there lets go of
     * the text and is disabled. \a withPlacement means nothing here: a text is as wide as the page.
     */
    QWidget *createOptionsWidget(QWidget *parent, bool withPlacement) override;

    bool isEditing() const { return !m_optionsWidget.isNull(); }

    QSize sizeHint() const override;
    QSize minimumSizeHint() const override;

    /** Shows the configuration's text with keywords expanded; never counts as an edit. */
    void refreshText();

    /** Size of the characters at the cursor in points, also where the text gives it in pixels or not at all.
     */
    qreal fontSize() const;
    bool isBold() const;
    /** Inserts a picture at the cursor, shown \a width pixels wide, and takes the keyboard focus back. */
    void insertPicture(const QPixmap &picture, int width, const QString &placement);
    /** What the text refers to: files only, and nothing that would have to be waited for. */
    QVariant loadResource(int type, const QUrl &name) override;
    /** Takes the keyboard focus back from the options panel. */
    void takeFocusBack();

    /** The keys that insert a link. */
    static QKeySequence linkKeys();

public slots:
    void slotTextChanged();
    void slotFontSizeChanged(unsigned int aPointSize);
    void slotTextColorChanged(const QColor &aColor);
    void slotAlignmentChanged(Qt::Alignment aAlignment);
    void slotVAlignmentChanged(QTextCharFormat::VerticalAlignment aAlignment);
    void slotBoldChanged(bool aBold);
    void slotItalicChanged(bool aItalic);
    void slotUnderlineChanged(bool aUnderline);
    void slotOptionsWidgetDestroyed();

protected:
    enum class Change { Edit, EndOfEditing };

    /**
     * Takes the text over into the configuration and announces it where it changed. Every edit marks the
     * template modified once more, whether the stored text changed or not: a deliberately coarse rule.
     */
    virtual void applyContent(Change change);

    /** Whether refreshText() would show what is shown already. */
    bool isUpToDate() const;

    bool event(QEvent *event) override;
    void showEvent(QShowEvent *event) override;
    void keyPressEvent(QKeyEvent *event) override;
    void wheelEvent(QWheelEvent *event) override;
    bool canInsertFromMimeData(const QMimeData *source) const override;
    void insertFromMimeData(const QMimeData *source) override;

    KvTextDocumentNodeCfg *cfg() const { return m_cfg; }

private:
    void setUpPaper();
    void setUpView();
    void setEditable(bool editable);
    void startEditing();
    void endEditing();
    void releaseOptionsWidget();
    void connectOptionsWidget();
    void showText(const QString &html);
    void switchText(const QString &html);
    QString expandedText() const;
    void applyPageWidth();
    void updateHeight();
    int documentHeight() const;

    KvTextDocumentNodeCfg *m_cfg;
    QPointer<KvTextDocumentNodeOptionsWidget> m_optionsWidget; ///< while one is open; not owned
    QString m_takenText;   ///< what the configuration got from the editing
    QString m_shownSource; ///< the configuration's text when it was shown last
    QString m_shownHtml;   ///< what was shown of it
};

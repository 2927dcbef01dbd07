// SPDX-License-Identifier: MIT
#pragma once

#include "blocks/common/KvBaseOptionsWidget.h"

#include <QPointer>
#include <QTextCharFormat>

class KvColorLabel;
class KvTextDocumentNodeCfg;
class KvTextDocumentNodeWidget;
class QComboBox;
class QHBoxLayout;
class QPushButton;

/**
 * Options panel of a text: formats its characters and paragraphs, and inserts links, pictures and keywords.
 *
 * The text can be edited for as long as the panel exists.
 */
class KvTextDocumentNodeOptionsWidget : public KvBaseOptionsWidget
{
    Q_OBJECT
public:
    /**
     * \param cfg  gives the keywords that can be inserted
     * \param text not owned; may be null or die before the panel, which then does nothing
     */
    KvTextDocumentNodeOptionsWidget(const KvTextDocumentNodeCfg *cfg, KvTextDocumentNodeWidget *text,
                                    QWidget *parent);

    /** Shows the format at the text's cursor; the configuration has nothing else to show. */
    void setFromConfig(const KvBaseEditorNodeCfg *cfg) override;

signals:
    void signalFontSizeChanged(unsigned int aPointSize);
    void signalTextColorChanged(const QColor &aColor);
    void signalAlignmentChanged(Qt::Alignment aAlignment);
    void signalVAlignmentChanged(QTextCharFormat::VerticalAlignment aAlignment);
    void signalBoldChanged(bool aBold);
    void signalItalicChanged(bool aItalic);
    void signalUnderlineChanged(bool aUnderline);

public slots:
    /** Sets every control to the format at the text's cursor; emits nothing. */
    void slotStateChanged();
    /** Asks for a link and inserts it in place of the selection. */
    void slotLinkClicked();
    /** Asks for a picture and inserts it in place of the selection. */
    void slotGalleryClicked();

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;

private slots:
    void slotFontSizeSelected(int aIndex);
    void slotAlignLeftClicked();
    void slotAlignCenterClicked();
    void slotAlignRightClicked();
    void slotAlignJustifyClicked();
    void slotSuperscriptClicked(bool aOn);
    void slotSubscriptClicked(bool aOn);
    void slotTagSelected(int aIndex);

private:
    QHBoxLayout *addButtonRow();
    void addFontRow();
    void addCharacterRow();
    void addAlignmentRow();
    void addInsertRow();
    void addTagRow(const KvTextDocumentNodeCfg *cfg);
    QPushButton *addButton(QHBoxLayout *row, const QString &text, bool isCheckable);
    QPushButton *addLetterButton(QHBoxLayout *row, const QString &letter, const QString &style,
                                 const QString &text);
    QPushButton *addIconButton(QHBoxLayout *row, const QString &iconPath, const QString &text,
                               bool isCheckable = true);
    void connectSignals();
    void checkAlignment(Qt::Alignment alignment);
    void checkVAlignment(QTextCharFormat::VerticalAlignment alignment);
    void selectAlignment(Qt::Alignment alignment);
    void selectVAlignment(QTextCharFormat::VerticalAlignment alignment);

    QPointer<KvTextDocumentNodeWidget> m_text;
    QComboBox *m_fontSizeBox = nullptr;
    KvColorLabel *m_colorLabel = nullptr;
    QPushButton *m_boldButton = nullptr;
    QPushButton *m_italicButton = nullptr;
    QPushButton *m_underlineButton = nullptr;
    QPushButton *m_leftButton = nullptr;
    QPushButton *m_centerButton = nullptr;
    QPushButton *m_rightButton = nullptr;
    QPushButton *m_justifyButton = nullptr;
    QPushButton *m_superscriptButton = nullptr;
    QPushButton *m_subscriptButton = nullptr;
    QPushButton *m_linkButton = nullptr;
    QPushButton *m_galleryButton = nullptr;
    QComboBox *m_tagBox = nullptr;
};

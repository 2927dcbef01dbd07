// SPDX-License-Identifier: MIT
#pragma once

#include <QIcon>
#include <QPixmap>
#include <QPointer>
#include <QString>

class KvBaseDisplayWidget;
class KvBaseEditorNodeCfg;
class KvEditorToolWidget;
class KvTemplateContext;
class QMimeData;
class QWidget;

/** Knows one block type: its name, title and icon, and how to make its configuration and display widget. */
class KvBaseEditorNodeFactory
{
public:
    virtual ~KvBaseEditorNodeFactory();

    /** A new display widget that draws the block from \a cfg, which is of this factory's making and outlives
     * it. */
    virtual KvBaseDisplayWidget *createDisplayWidget(QWidget *parent, KvBaseEditorNodeCfg *cfg) = 0;
    /** A new configuration with its defaults, bound to \a context. The caller owns it. */
    virtual KvBaseEditorNodeCfg *createConfig(KvTemplateContext *context) = 0;
    /** The block type's row in the editor's palette: made on the first call, the same one afterwards. */
    virtual KvEditorToolWidget *toolWidget(QWidget *parent);

    QString name() const { return m_name; }
    QString title() const { return m_title; }
    QIcon icon() const { return m_icon; }

    /** Picture of the tool widget, shown under the cursor during a drag. Grabbed once. */
    QPixmap dragPixmap();
    /** New drag data that carries the block type's name; the caller owns it. */
    QMimeData *mimeData() const;

    /** Format of mimeData(): a QDataStream of the text "nodeType" and the block type's name. */
    static const char MimeFormat[];

protected:
    /**
     * \param name     untranslated type name, the key in files
     * \param title    translated title for the palette
     * \param iconPath SVG of the palette icon
     */
    KvBaseEditorNodeFactory(const QString &name, const QString &title, const QString &iconPath);

private:
    Q_DISABLE_COPY(KvBaseEditorNodeFactory)

    QString m_name;
    QString m_title;
    QIcon m_icon;
    QPointer<KvEditorToolWidget> m_toolWidget; ///< may be deleted by its parent
    QPixmap m_preview;
};

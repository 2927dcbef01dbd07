// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>
#include <QPointer>
#include <QString>

#include <memory>

class KvBaseDisplayWidget;
class KvBaseEditorNodeCfg;
class KvBaseEditorNodeFactory;
class KvTemplateContext;
class KvTemplateModel;
class QJsonArray;
class QMimeData;
class QWidget;

/** One block of a template: owns its configuration and, once shown, its display widget with all pieces. */
class KvReportNode : public QObject
{
    Q_OBJECT
public:
    /** \a displayParent (may be null) becomes the parent of display widgets. Factory, context, model are not
     * owned. */
    KvReportNode(QWidget *displayParent, KvBaseEditorNodeFactory *factory, KvTemplateContext *context,
                 KvTemplateModel *model = nullptr);
    ~KvReportNode() override;

    /** The model that the block is in. */
    KvTemplateModel *model() const { return m_model; }
    KvBaseEditorNodeFactory *factory() const { return m_factory; }
    KvTemplateContext *context() const { return m_context; }
    KvBaseEditorNodeCfg *config() const { return m_config.get(); }
    /** Block type name: the factory's name. */
    QString typeName() const;

    /** The display widget, made on first use. */
    KvBaseDisplayWidget *displayWidget();

    /** Deletes the display widget; the next use makes another one from the present configuration. */
    void resetDisplayWidget();

    /** Appends {"name", "config"} to \a nodes; false (nothing appended) when the configuration fails to write
     * itself. */
    bool toJson(QJsonArray &nodes) const;

    /** New drag data for moving the block, which stands at \a index; the caller owns it. */
    QMimeData *mimeData(int index) const;

    /** Format of mimeData(): a QDataStream of the text "nodeIndex" and the index as a 32-bit number. */
    static const char MimeFormat[];

private slots:
    void slotDisplayWidgetDestroyed();

private:
    KvTemplateModel *m_model;
    KvBaseEditorNodeFactory *m_factory;
    QPointer<QWidget> m_displayParent;
    KvBaseDisplayWidget *m_displayWidget = nullptr;
    KvTemplateContext *m_context;
    std::unique_ptr<KvBaseEditorNodeCfg> m_config;
};

// SPDX-License-Identifier: MIT
#pragma once

#include "templates/KvTemplateContext.h"

#include <QObject>
#include <QPointer>
#include <QString>
#include <QVector>

#include <memory>
#include <vector>

class KvBlockRegistry;
class KvFooterWidget;
class KvHeaderWidget;
class KvPageCountWidget;
class KvPageSectionsCfg;
class KvPrintProgress;
class KvReportKernelData;
class KvReportNode;
class KvUserMessages;
class QJsonArray;
class QJsonObject;
class QWidget;

/**
 * A report template in memory: an ordered list of blocks, three page sections and the page context. Reads and
 * writes .rtp files and tells its views of every change.
 */
class KvTemplateModel : public QObject
{
    Q_OBJECT
public:
    /** \a displayParent (may be null) becomes the parent of blocks' and sections' widgets. */
    KvTemplateModel(QWidget *displayParent, KvReportKernelData *kernelData);
    ~KvTemplateModel() override;

    /** The block types that files may name; not owned. Set once after construction. */
    void setFactories(KvBlockRegistry *factories) { m_factories = factories; }
    /** How failures are told; not owned. Null means modal message boxes. */
    void setUserMessages(KvUserMessages *messages) { m_messages = messages; }

    /**
     * Reads a template file. False when the file cannot be read or is no template (a message says so, but for
     * a document that is no object), and when a block is refused: the blocks before it are then in the model,
     * while path and modified state stay as they were.
     */
    bool load(const QString &path);
    /** Writes a template file, replacing what is there. False when it could not be created or written. */
    bool save(const QString &path);
    /** Starts a new, empty template. Always true. */
    bool newTemplate();
    /** Prints the template to a PDF file; 1 when it was written, 0 when not. \a progress may be null. */
    int print(const QString &target, KvPrintProgress *progress = nullptr);

    void appendNode(KvReportNode *node);            ///< takes the node over
    void insertNode(int index, KvReportNode *node); ///< takes over; -1 or beyond the end appends
    /** A new block of a type, appended for -1 or an index beyond the end; null for an unknown type. */
    KvReportNode *createNode(const QString &typeName, int index);
    /** Moves a block, the others keep their order; -1 is the last place. Emits nothing and does not mark
     * modified. */
    void moveNode(int from, int to);
    void removeNode(KvReportNode *node);
    void clearNodes();
    int nodeCount() const { return m_nodes.size(); }
    KvReportNode *node(int index) const { return m_nodes.value(index); }
    const QVector<KvReportNode *> &nodes() const { return m_nodes; }
    void notifyListChanged();

    KvTemplateContext *context() { return &m_context; }
    const KvTemplateContext *context() const { return &m_context; }
    int pageWidth() const { return m_context.pageWidth(); }
    void setPageWidth(int width) { m_context.setPageWidth(width); }
    /** To be called in pairs: live data is counted. */
    void beginLiveUpdates() { m_context.beginLiveUpdates(); }
    void endLiveUpdates() { m_context.endLiveUpdates(); }

    bool isHeaderEnabled() const;
    bool isFooterEnabled() const;
    bool isPageNumberingEnabled() const;
    void setHeaderEnabled(bool enabled);
    void setFooterEnabled(bool enabled);
    void setPageNumberingEnabled(bool enabled);
    KvPageSectionsCfg *header() const { return m_header.get(); }
    KvPageSectionsCfg *footer() const { return m_footer.get(); }
    KvPageSectionsCfg *pageNumbering() const { return m_pageNumbering.get(); }

    /** New widgets for one page; the caller owns them. */
    KvHeaderWidget *createHeaderWidget() const;
    KvFooterWidget *createFooterWidget() const;
    KvPageCountWidget *createPageCountWidget(int pageIndex) const;

    QString filePath() const { return m_filePath; }
    bool isModified() const { return m_modified; }
    /**
     * True while a file is read, until the last change that it causes is announced: views that rebuild
     * themselves on each announcement wait for that one, or a file of n blocks costs n rebuilds.
     */
    bool isLoading() const { return m_loading; }

signals:
    void signalTemplateStatusChanged(const QString &aPath, bool aIsModified);
    void signalCloseAllEditors();
    void signalListChanged();
    void signalBeforeDeleteNode(KvReportNode *aNode);
    void signalHeaderStateChanged(bool aEnabled);
    void signalFooterStateChanged(bool aEnabled);
    void signalPageNumberingStateChanged(bool aEnabled);

public slots:
    void slotTemplateModified();

private:
    using SectionPointer = std::unique_ptr<KvPageSectionsCfg>;
    using NodeList = std::vector<std::unique_ptr<KvReportNode>>;

    void warn(const QString &title, const QString &text) const;
    bool readObject(const QString &path, QJsonObject &root) const;
    bool readTemplate(const QJsonObject &root);
    void readSections(const QJsonObject &root, bool isLast);
    bool readNodes(const QJsonArray &elements);
    bool makeNodes(const QJsonArray &elements, NodeList &nodes);
    bool writeObject(QJsonObject &root) const;
    void setState(const QString &path, bool modified);
    void markListModified();
    void emitSectionStates();

    KvBlockRegistry *m_factories = nullptr;
    KvUserMessages *m_messages = nullptr;
    QVector<KvReportNode *> m_nodes;
    KvTemplateContext m_context;
    SectionPointer m_header;
    SectionPointer m_footer;
    SectionPointer m_pageNumbering;
    QPointer<QWidget> m_displayParent;
    QString m_filePath;
    bool m_modified = false;
    bool m_loading = false;
};

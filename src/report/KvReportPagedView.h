// SPDX-License-Identifier: MIT
#pragma once

#include <QGraphicsView>
#include <QList>
#include <QPointer>
#include <QVector>

#include <memory>
#include <vector>

class KvReportNode;
class KvReportPage;
class KvReportProxyWidgetItem;
class KvTemplateModel;

/**
 * Shows a template as a column of pages on a dark background and flows its blocks onto them.
 *
 * A page always spans the view; blocks flow anew whenever the template, the page width or a block's size
 * changes.
 */
class KvReportPagedView : public QGraphicsView
{
    Q_OBJECT
public:
    explicit KvReportPagedView(QWidget *parent = nullptr);
    ~KvReportPagedView() override;

    /** Set once; not owned, may be null. */
    void setModel(KvTemplateModel *model);
    /** Null, too, once the model is gone. */
    KvTemplateModel *model() const;

    const QVector<KvReportPage *> &pages() const { return m_pages; }
    /** Items of all pieces of blocks, in layout order. */
    const QList<KvReportProxyWidgetItem *> &pieceItems() const { return m_pieceItems; }

public slots:
    void slotWidgetsListChanged();
    void slotUpdateSceneWithSizes();
    void slotBeforeDeleteNode(KvReportNode *aNode);

protected:
    void resizeEvent(QResizeEvent *event) override;
    void showEvent(QShowEvent *event) override;

private:
    void clearScene();
    void replacePages();
    void addPages();
    KvReportPage *addPage();
    QRect contentRectOf(int page);
    void connectNode(KvReportNode *node);
    void dropPagesFrom(int count);
    void finishLayout();
    bool applyViewWidth();

    QGraphicsScene *m_scene;
    QPointer<KvTemplateModel> m_model;
    QVector<KvReportPage *> m_pages;
    std::vector<std::unique_ptr<KvReportPage>> m_droppedPages; ///< off the scene, deleted by the event loop
    QList<KvReportProxyWidgetItem *> m_pieceItems;
    bool m_layoutRunning = false;
};

// SPDX-License-Identifier: MIT
#pragma once

#include "blocks/FakeMeasurements.h"
#include "editor/KvEditorToolsList.h"
#include "editor/KvTemplatesEditorWindow.h"
#include "report/KvReportNode.h"
#include "report/KvReportPagedView.h"
#include "support/FakeBlock.h"
#include "templates/KvTemplateModel.h"

#include <QPushButton>

#include <functional>

/** Options panel of a made-up block, with two controls; says when it dies, which is when real ones commit
 * their text. */
class FakeOptions : public QWidget
{
public:
    FakeOptions(QWidget *parent, bool withPlacement)
        : QWidget(parent)
        , m_withPlacement(withPlacement)
    {
        new QPushButton(QStringLiteral("First"), this);
        new QPushButton(QStringLiteral("Second"), this);
    }
    ~FakeOptions() override
    {
        if (m_whenDying)
            m_whenDying();
    }

    bool withPlacement() const { return m_withPlacement; }
    void setWhenDying(const std::function<void()> &whenDying) { m_whenDying = whenDying; }

private:
    bool m_withPlacement;
    std::function<void()> m_whenDying;
};

/** What a test wants to happen while a report is printed. */
struct PaintHook
{
    std::function<void()> whenPainted;
};

/** Piece of a block that calls a hook while it is painted. */
class HookedPiece : public FakePiece
{
public:
    HookedPiece(const KvTemplateContext *context, int height, const PaintHook *hook)
        : FakePiece(context, height, QStringLiteral("hooked"))
        , m_hook(hook)
    {}

protected:
    void paintEvent(QPaintEvent *event) override
    {
        FakePiece::paintEvent(event);
        if (m_hook->whenPainted)
            m_hook->whenPainted();
    }

private:
    const PaintHook *m_hook;
};

class HookedBlock : public KvBaseDisplayWidget
{
public:
    HookedBlock(FakeBlockCfg *cfg, const PaintHook *hook)
        : m_piece(std::make_unique<HookedPiece>(cfg->context(), cfg->heights().value(0), hook))
    {}

    QString displayName() const override { return QStringLiteral("Hooked"); }
    QWidget *subWidgetAt(int index) override { return index == 0 ? m_piece.get() : nullptr; }
    QWidget *createOptionsWidget(QWidget *parent, bool withPlacement) override
    {
        return new FakeOptions(parent, withPlacement);
    }
    QWidget *piece() const { return m_piece.get(); }

private:
    std::unique_ptr<HookedPiece> m_piece;
};

class HookedFactory : public FakeBlockFactory
{
public:
    HookedFactory()
        : FakeBlockFactory(QStringLiteral("Hooked"))
    {}

    KvBaseDisplayWidget *createDisplayWidget(QWidget *parent, KvBaseEditorNodeCfg *cfg) override
    {
        Q_UNUSED(parent)
        return new HookedBlock(static_cast<FakeBlockCfg *>(cfg), &m_hook);
    }
    void setWhenPainted(const std::function<void()> &whenPainted) { m_hook.whenPainted = whenPainted; }

private:
    PaintHook m_hook;
};

/** An editor of made-up templates, whose folders are not remembered anywhere. */
class FakeEditor : public KvTemplatesEditorWindow
{
public:
    explicit FakeEditor(KvReportKernelData *kernelData, QWidget *parent = nullptr)
        : KvTemplatesEditorWindow(QStringLiteral("Fake editor"), kernelData, parent)
    {
        auto factory = std::make_unique<HookedFactory>();
        m_factory = factory.get();
        toolsList()->registerFactory(std::move(factory));
    }

    QString templatesDirectory() const override { return m_templatesDirectory; }
    void setTemplatesDirectory(const QString &directory) override { m_templatesDirectory = directory; }
    QString printDirectory() const override { return m_printDirectory; }
    void setPrintDirectory(const QString &directory) override { m_printDirectory = directory; }
    QString templateFileSuffix() const override { return QStringLiteral("fake"); }
    QString templateFileFilter() const override { return QStringLiteral("Fake file (*.fake)"); }

    HookedFactory *factory() const { return m_factory; }
    QPushButton *button(const char *name) const { return findChild<QPushButton *>(QLatin1String(name)); }
    /** Appends a block of one piece. */
    KvReportNode *addBlock(int height = 100)
    {
        auto *node = new KvReportNode(nullptr, m_factory, templateModel()->context(), templateModel());
        static_cast<FakeBlockCfg *>(node->config())->setHeights({height});
        templateModel()->appendNode(node);
        return node;
    }
    static QWidget *pieceOf(KvReportNode *node)
    {
        return static_cast<HookedBlock *>(node->displayWidget())->piece();
    }

private:
    HookedFactory *m_factory = nullptr;
    QString m_templatesDirectory;
    QString m_printDirectory;
};

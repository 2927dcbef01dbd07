// SPDX-License-Identifier: MIT
#pragma once

#include "report/KvBaseDisplayWidget.h"
#include "report/KvBaseDisplayWidgetSignals.h"
#include "templates/KvBaseEditorNodeCfg.h"
#include "templates/KvBaseEditorNodeFactory.h"
#include "templates/KvTemplateContext.h"

#include <QJsonArray>
#include <QJsonObject>
#include <QPainter>
#include <QPointer>
#include <QVector>
#include <QWidget>

/** Piece of a made-up block: as wide as the page's content, of a height that the test sets, with a text on
 * it. */
class FakePiece : public QWidget
{
public:
    FakePiece(const KvTemplateContext *context, int height, const QString &label)
        : m_context(context)
        , m_height(height)
        , m_label(label)
    {
        ++alive();
    }
    ~FakePiece() override { --alive(); }

    /** Number of pieces that exist in the program. */
    static int &alive()
    {
        static int count = 0;
        return count;
    }

    void setHeightHint(int height) { m_height = height; }
    /** How often the layout asked for the size. */
    int sizeRequests() const { return m_sizeRequests; }

    QSize sizeHint() const override
    {
        ++m_sizeRequests;
        return QSize(m_context ? m_context->usableWidth() : 100, m_height);
    }

protected:
    void paintEvent(QPaintEvent *event) override
    {
        Q_UNUSED(event)
        QPainter painter(this);
        QFont font(QStringLiteral("Segoe UI"));
        font.setPixelSize(12);
        painter.setFont(font);
        painter.setPen(Qt::black);
        painter.drawText(4, 14, m_label);
    }

private:
    const KvTemplateContext *m_context;
    int m_height;
    QString m_label;
    mutable int m_sizeRequests = 0;
};

/**
 * Configuration of a made-up block: the heights of its pieces, where a negative one stands for a null piece.
 *
 * A "config" object without "heights" is refused; with "unwritable" it is read, but cannot be written again.
 */
class FakeBlockCfg : public KvBaseEditorNodeCfg
{
public:
    explicit FakeBlockCfg(KvTemplateContext *context)
        : KvBaseEditorNodeCfg(context)
    {}

    bool toJson(QJsonObject &config) const override
    {
        QJsonArray heights;
        for (const int height : m_heights)
            heights.append(height);
        config[QStringLiteral("heights")] = heights;
        return m_writable;
    }

    bool fromJson(const QJsonObject &config) override
    {
        if (!config.value(QStringLiteral("heights")).isArray())
            return false;
        m_heights.clear();
        const QJsonArray heights = config.value(QStringLiteral("heights")).toArray();
        for (const QJsonValue &height : heights)
            m_heights.append(height.toInt());
        m_writable = !config.contains(QStringLiteral("unwritable"));
        return true;
    }

    const QVector<int> &heights() const { return m_heights; }
    void setHeights(const QVector<int> &heights) { m_heights = heights; }
    void setWritable(bool writable) { m_writable = writable; }

private:
    QVector<int> m_heights{100};
    bool m_writable = true;
};

/** Display object of a made-up block; pieces are made on first request and kept. */
class FakeBlockWidget : public KvBaseDisplayWidget
{
public:
    explicit FakeBlockWidget(FakeBlockCfg *cfg, const QString &label)
        : m_cfg(cfg)
        , m_label(label)
    {}
    ~FakeBlockWidget() override
    {
        for (const QPointer<FakePiece> &piece : qAsConst(m_pieces))
            delete piece;
    }

    QString displayName() const override { return m_label; }
    int subWidgetCount() override { return m_cfg->heights().size(); }
    QWidget *subWidgetAt(int index) override
    {
        ++m_pieceRequests;
        const int height = m_cfg->heights().value(index, -1);
        if (height < 0)
            return nullptr;
        while (m_pieces.size() <= index)
            m_pieces.append(nullptr);
        QPointer<FakePiece> &piece = m_pieces[index];
        if (!piece)
            piece = new FakePiece(m_cfg->context(), height, QStringLiteral("%1.%2").arg(m_label).arg(index));
        piece->setHeightHint(height);
        return piece;
    }
    QWidget *createOptionsWidget(QWidget *parent, bool withPlacement) override
    {
        Q_UNUSED(withPlacement)
        return new QWidget(parent);
    }

    FakePiece *piece(int index) const { return m_pieces.value(index); }
    /** How often a layout asked for a piece. */
    int pieceRequests() const { return m_pieceRequests; }

private:
    FakeBlockCfg *m_cfg;
    QString m_label;
    QVector<QPointer<FakePiece>> m_pieces;
    int m_pieceRequests = 0;
};

/** Makes made-up blocks. Their pieces are labelled with a letter per block, "A.0", "A.1", "B.0" ... */
class FakeBlockFactory : public KvBaseEditorNodeFactory
{
public:
    explicit FakeBlockFactory(const QString &name = QStringLiteral("Fake"))
        : KvBaseEditorNodeFactory(name, name + QStringLiteral(" title"), QStringLiteral("Icons/fake.svg"))
    {}

    KvBaseDisplayWidget *createDisplayWidget(QWidget *parent, KvBaseEditorNodeCfg *cfg) override
    {
        Q_UNUSED(parent)
        ++m_widgetsMade;
        if (m_withoutWidgets)
            return nullptr;
        const QString label(QChar(u'A' + (m_widgetsMade - 1) % 26));
        return new FakeBlockWidget(static_cast<FakeBlockCfg *>(cfg), label);
    }
    KvBaseEditorNodeCfg *createConfig(KvTemplateContext *context) override
    {
        return new FakeBlockCfg(context);
    }

    int widgetsMade() const { return m_widgetsMade; }
    /** From now on display widgets are null. */
    void setWithoutWidgets(bool without) { m_withoutWidgets = without; }

private:
    int m_widgetsMade = 0;
    bool m_withoutWidgets = false;
};

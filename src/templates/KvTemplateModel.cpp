// SPDX-License-Identifier: MIT
#include "templates/KvTemplateModel.h"

#include "data/KvReportKernelData.h"
#include "kernel/ZtLeftToRight.h"
#include "report/KvFooterWidget.h"
#include "report/KvHeaderWidget.h"
#include "report/KvPageCountWidget.h"
#include "report/KvReportGlyphs.h"
#include "report/KvReportNode.h"
#include "report/KvReportPrinter.h"
#include "templates/KvBaseEditorNodeCfg.h"
#include "templates/KvBlockRegistry.h"
#include "templates/KvPageSectionsCfg.h"
#include "templates/KvUserMessages.h"

#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

namespace {

const char kConfigKey[] = "config";
const char kHeaderKey[] = "header";
const char kFooterKey[] = "footer";
const char kPageNumberingKey[] = "pageNumbering";
const char kNodesKey[] = "nodes";
const char kNameKey[] = "name";

// No template of pictures and text comes near this; without a limit a wrong path such as a device would never
// end.
constexpr qint64 kLargestFile = 256LL * 1024 * 1024;

std::unique_ptr<KvPageSectionsCfg> makeSection(KvTemplateContext *context)
{
    return std::make_unique<KvPageSectionsCfg>(context);
}

QJsonObject sectionObject(const KvPageSectionsCfg &section)
{
    QJsonObject object;
    section.toJson(object);
    return object;
}

} // namespace

KvTemplateModel::KvTemplateModel(QWidget *displayParent, KvReportKernelData *kernelData)
    : m_context(kernelData)
    , m_header(makeSection(&m_context))
    , m_footer(makeSection(&m_context))
    , m_pageNumbering(makeSection(&m_context))
    , m_displayParent(displayParent)
{
    qRegisterMetaType<KvReportNode *>("KvReportNode*");
    connect(&m_context, SIGNAL(signalTemplateModified()), this, SLOT(slotTemplateModified()));
}

KvTemplateModel::~KvTemplateModel()
{
    // Blocks hold pointers into the context, which dies with this object.
    qDeleteAll(m_nodes);
}

void KvTemplateModel::warn(const QString &title, const QString &text) const
{
    KvMessageBoxes boxes;
    KvUserMessages *messages = m_messages ? m_messages : &boxes;
    messages->warn(title, text);
}

bool KvTemplateModel::load(const QString &path)
{
    QJsonObject root;
    if (!readObject(path, root))
        return false;
    const bool wasModified = m_modified;
    m_loading = true;
    const bool isRead = readTemplate(root);
    m_loading = false;
    if (isRead) {
        setState(path, false);
        return true;
    }
    // The blocks before the refused one are there, but the template stays the one it was.
    setState(m_filePath, wasModified);
    return false;
}

bool KvTemplateModel::readObject(const QString &path, QJsonObject &root) const
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly)) {
        warn(tr("Cannot read"), tr("Cannot open file %1").arg(ZtLeftToRight::isolated(path)));
        return false;
    }
    const QByteArray bytes = file.read(kLargestFile + 1);
    QJsonParseError error;
    const QJsonDocument document = QJsonDocument::fromJson(bytes, &error);
    if (error.error != QJsonParseError::NoError || bytes.size() > kLargestFile) {
        warn(tr("Error reading file"), tr("Cannot read file %1").arg(ZtLeftToRight::isolated(path)));
        return false;
    }
    root = document.object();
    return document.isObject();
}

bool KvTemplateModel::readTemplate(const QJsonObject &root)
{
    const QJsonValue config = root.value(QLatin1String(kConfigKey));
    if (config.isObject())
        m_context.fromJson(config.toObject());
    const QJsonValue nodes = root.value(QLatin1String(kNodesKey));
    readSections(root, !nodes.isArray());
    // A file without a list of blocks changes page and sections only; the blocks stay. Deliberate.
    return nodes.isArray() ? readNodes(nodes.toArray()) : true;
}

void KvTemplateModel::readSections(const QJsonObject &root, bool isLast)
{
    m_header->fromJson(root.value(QLatin1String(kHeaderKey)).toObject());
    emit signalHeaderStateChanged(m_header->isEnabled());
    m_footer->fromJson(root.value(QLatin1String(kFooterKey)).toObject());
    emit signalFooterStateChanged(m_footer->isEnabled());
    m_pageNumbering->fromJson(root.value(QLatin1String(kPageNumberingKey)).toObject());
    if (isLast)
        m_loading = false;
    emit signalPageNumberingStateChanged(m_pageNumbering->isEnabled());
}

bool KvTemplateModel::readNodes(const QJsonArray &elements)
{
    // Made before the old blocks go: the last announcement has to be known as such, also when a block is
    // refused.
    NodeList nodes;
    const bool isRead = makeNodes(elements, nodes);
    m_loading = !nodes.empty();
    clearNodes();
    for (std::unique_ptr<KvReportNode> &node : nodes) {
        m_loading = &node != &nodes.back();
        appendNode(node.release());
    }
    return isRead;
}

bool KvTemplateModel::makeNodes(const QJsonArray &elements, NodeList &nodes)
{
    for (const QJsonValue &value : elements) {
        const QJsonObject element = value.toObject();
        const QJsonValue name = element.value(QLatin1String(kNameKey));
        KvBaseEditorNodeFactory *factory =
            name.isString() && m_factories ? m_factories->find(name.toString()) : nullptr;
        if (!factory)
            continue;
        const QJsonValue config = element.value(QLatin1String(kConfigKey));
        auto node = std::make_unique<KvReportNode>(m_displayParent, factory, &m_context, this);
        if (!config.isObject() || !node->config()->fromJson(config.toObject()))
            return false;
        nodes.push_back(std::move(node));
    }
    return true;
}

bool KvTemplateModel::save(const QString &path)
{
    emit signalCloseAllEditors();
    QFile file(path);
    if (!file.open(QIODevice::WriteOnly | QIODevice::Truncate)) {
        warn(tr("Cannot save"), tr("Cannot create file %1").arg(ZtLeftToRight::isolated(path)));
        return false;
    }
    QJsonObject root;
    if (!writeObject(root))
        return false;
    // Flushed here: what only reached a buffer was not written when the disk is full.
    if (file.write(QJsonDocument(root).toJson()) <= 0 || !file.flush())
        return false;
    setState(path, false);
    return true;
}

bool KvTemplateModel::writeObject(QJsonObject &root) const
{
    QJsonObject config;
    m_context.toJson(config);
    QJsonArray nodes;
    for (const KvReportNode *node : m_nodes) {
        if (!node->toJson(nodes))
            return false;
    }
    root[QLatin1String(kConfigKey)] = config;
    root[QLatin1String(kHeaderKey)] = sectionObject(*m_header);
    root[QLatin1String(kFooterKey)] = sectionObject(*m_footer);
    root[QLatin1String(kPageNumberingKey)] = sectionObject(*m_pageNumbering);
    root[QLatin1String(kNodesKey)] = nodes;
    return true;
}

bool KvTemplateModel::newTemplate()
{
    clearNodes();
    m_context.resetDefaults();
    // The pages show widgets of the old sections until the signals below make them rebuild.
    const SectionPointer oldHeader = std::exchange(m_header, makeSection(&m_context));
    const SectionPointer oldFooter = std::exchange(m_footer, makeSection(&m_context));
    const SectionPointer oldPageNumbering = std::exchange(m_pageNumbering, makeSection(&m_context));
    emitSectionStates();
    setState(QString(), false);
    return true;
}

void KvTemplateModel::emitSectionStates()
{
    emit signalHeaderStateChanged(isHeaderEnabled());
    emit signalFooterStateChanged(isFooterEnabled());
    emit signalPageNumberingStateChanged(isPageNumberingEnabled());
}

int KvTemplateModel::print(const QString &target, KvPrintProgress *progress)
{
    emit signalCloseAllEditors();
    KvReportGlyphs::logMissing(*this);
    KvReportPrinter printer(this);
    printer.setProgress(progress);
    return printer.print(target) ? 1 : 0;
}

void KvTemplateModel::appendNode(KvReportNode *node)
{
    m_nodes.append(node);
    markListModified();
}

void KvTemplateModel::insertNode(int index, KvReportNode *node)
{
    if (index < -1)
        return;
    const bool atEnd = index == -1 || index > m_nodes.size();
    m_nodes.insert(atEnd ? m_nodes.size() : index, node);
    markListModified();
}

KvReportNode *KvTemplateModel::createNode(const QString &typeName, int index)
{
    KvBaseEditorNodeFactory *factory = m_factories ? m_factories->find(typeName) : nullptr;
    if (!factory || index < -1)
        return nullptr;
    auto *node = new KvReportNode(m_displayParent, factory, &m_context, this);
    insertNode(index, node);
    return node;
}

void KvTemplateModel::moveNode(int from, int to)
{
    const int count = m_nodes.size();
    if (from < 0 || from >= count || to < -1 || to >= count)
        return;
    const int target = to == -1 ? count - 1 : to;
    const int step = target > from ? 1 : -1;
    for (int i = from; i != target; i += step)
        std::swap(m_nodes[i], m_nodes[i + step]);
}

void KvTemplateModel::removeNode(KvReportNode *node)
{
    if (!node || !m_nodes.contains(node))
        return;
    emit signalBeforeDeleteNode(node);
    delete node;
    m_nodes.removeAll(node);
    markListModified();
}

void KvTemplateModel::clearNodes()
{
    // Off the list first: whoever looks at the list while a block is announced and deleted finds no dead
    // ones.
    const QVector<KvReportNode *> nodes = std::exchange(m_nodes, {});
    for (KvReportNode *node : nodes) {
        emit signalBeforeDeleteNode(node);
        delete node;
    }
    emit signalListChanged();
}

void KvTemplateModel::notifyListChanged()
{
    emit signalListChanged();
}

bool KvTemplateModel::isHeaderEnabled() const
{
    return m_header->isEnabled();
}

bool KvTemplateModel::isFooterEnabled() const
{
    return m_footer->isEnabled();
}

bool KvTemplateModel::isPageNumberingEnabled() const
{
    return m_pageNumbering->isEnabled();
}

void KvTemplateModel::setHeaderEnabled(bool enabled)
{
    if (!m_header->setEnabled(enabled))
        return;
    emit signalHeaderStateChanged(enabled);
    slotTemplateModified();
}

void KvTemplateModel::setFooterEnabled(bool enabled)
{
    if (!m_footer->setEnabled(enabled))
        return;
    emit signalFooterStateChanged(enabled);
    slotTemplateModified();
}

void KvTemplateModel::setPageNumberingEnabled(bool enabled)
{
    if (!m_pageNumbering->setEnabled(enabled))
        return;
    emit signalPageNumberingStateChanged(enabled);
    slotTemplateModified();
}

KvHeaderWidget *KvTemplateModel::createHeaderWidget() const
{
    return new KvHeaderWidget(m_displayParent, m_header.get());
}

KvFooterWidget *KvTemplateModel::createFooterWidget() const
{
    return new KvFooterWidget(m_displayParent, m_footer.get());
}

KvPageCountWidget *KvTemplateModel::createPageCountWidget(int pageIndex) const
{
    return new KvPageCountWidget(m_displayParent, pageIndex);
}

void KvTemplateModel::setState(const QString &path, bool modified)
{
    if (path == m_filePath && modified == m_modified)
        return;
    m_filePath = path;
    m_modified = modified;
    emit signalTemplateStatusChanged(m_filePath, m_modified);
}

void KvTemplateModel::markListModified()
{
    slotTemplateModified();
    emit signalListChanged();
}

void KvTemplateModel::slotTemplateModified()
{
    setState(m_filePath, true);
}

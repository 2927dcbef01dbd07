// SPDX-License-Identifier: MIT
#include "EditorCases.h"

#include "blocks/KvReportBlocks.h"
#include "blocks/textdocument/KvTextDocumentNodeCfg.h"
#include "data/KvReportKernelData.h"
#include "editor/KvReportTemplatesEditor.h"
#include "report/KvBaseDisplayWidget.h"
#include "report/KvPageFlow.h"
#include "report/KvReportNode.h"
#include "report/KvReportPagedView.h"
#include "report/KvReportProxyWidgetItem.h"
#include "templates/KvBaseEditorNodeFactory.h"
#include "templates/KvBlockRegistry.h"
#include "templates/KvPageSectionsCfg.h"
#include "templates/KvTemplateModel.h"

#include <QCoreApplication>
#include <QDragMoveEvent>
#include <QElapsedTimer>
#include <QMimeData>
#include <QTextCursor>
#include <QTextEdit>
#include <QVector>

namespace {

constexpr QSize kViewSize(1006, 900); // pages of 952 pixels
const char kTextType[] = "Text Document";

QString paragraphs(int count)
{
    return QStringLiteral("<p>The sample was measured as received, at 23 °C, with a <b>calibrated</b> scale; "
                          "every value is the mean of three readings, and none was left out.</p>")
        .repeated(count);
}

} // namespace

EditedReport::EditedReport(int blocks, int paragraphCount)
    : m_kernelData(std::make_unique<KvReportKernelData>())
    , m_blocks(std::make_unique<KvBlockTypeList>())
    , m_model(std::make_unique<KvTemplateModel>(nullptr, m_kernelData.get()))
    , m_view(std::make_unique<KvReportPagedView>())
{
    registerReportBlocks(*m_blocks);
    m_model->setFactories(m_blocks.get());
    m_model->header()->setText(QStringLiteral("<p>Report of ${CREATION_DATE_ISO}</p>"));
    m_model->footer()->setText(QStringLiteral("<p>${PROGRAM_NAME} ${PROGRAM_VERSION}</p>"));
    for (int i = 0; i < blocks; ++i) {
        auto *node = new KvReportNode(nullptr, m_blocks->find(QLatin1String(kTextType)), m_model->context(),
                                      m_model.get());
        static_cast<KvTextDocumentNodeCfg *>(node->config())->setText(paragraphs(paragraphCount));
        m_model->appendNode(node);
    }
    m_model->setHeaderEnabled(true);
    m_model->setFooterEnabled(true);
    m_model->setPageNumberingEnabled(true);
    m_view->setModel(m_model.get());
    m_view->resize(kViewSize);
    m_view->show();
    QCoreApplication::processEvents();
}

EditedReport::~EditedReport() = default;

int EditedReport::pageCount() const
{
    return m_view->pages().size();
}

QTextEdit *EditedReport::firstText() const
{
    return qobject_cast<QTextEdit *>(m_model->node(0)->displayWidget()->subWidgetAt(0));
}

void EditedReport::type()
{
    change("x");
}

void EditedReport::typeLine()
{
    change("\n");
}

void EditedReport::change(const char *text)
{
    QTextCursor cursor = firstText()->textCursor();
    if (m_isOdd)
        cursor.deletePreviousChar();
    else
        cursor.insertText(QLatin1String(text));
    firstText()->setTextCursor(cursor);
    m_isOdd = !m_isOdd;
    QCoreApplication::processEvents();
}

void EditedReport::moveMark()
{
    const std::unique_ptr<QMimeData> data(m_blocks->find(QLatin1String(kTextType))->mimeData());
    const KvReportProxyWidgetItem *item = m_view->pieceItems().at(m_isOdd ? 0 : 2);
    const QPointF point = item->scenePos() + QPointF(item->size().width() / 2, item->size().height() - 1);
    const QPoint position = m_view->mapFromScene(point);
    if (m_view->dropIndex() < 0) {
        // Qt delivers moves only to a widget that the drag has entered.
        QDragEnterEvent enter(position, Qt::CopyAction, data.get(), Qt::LeftButton, Qt::NoModifier);
        QCoreApplication::sendEvent(m_view->viewport(), &enter);
    }
    QDragMoveEvent event(position, Qt::CopyAction, data.get(), Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(m_view->viewport(), &event);
    m_isOdd = !m_isOdd;
    QCoreApplication::processEvents();
}

double openEditor()
{
    KvReportKernelData kernelData;
    QElapsedTimer timer;
    timer.start();
    KvReportTemplatesEditor editor(&kernelData, nullptr);
    editor.templateModel()->newTemplate();
    editor.show();
    QCoreApplication::processEvents();
    return static_cast<double>(timer.nsecsElapsed()) / 1e6;
}

EditorFile::EditorFile(int blocks)
    : m_kernelData(std::make_unique<KvReportKernelData>())
    , m_editor(std::make_unique<KvReportTemplatesEditor>(m_kernelData.get(), nullptr))
{
    for (int i = 0; i < blocks; ++i) {
        KvReportNode *node = m_editor->templateModel()->createNode(QLatin1String(kTextType), -1);
        static_cast<KvTextDocumentNodeCfg *>(node->config())->setText(paragraphs(5));
    }
    m_editor->templateModel()->save(m_folder.filePath(QStringLiteral("bench.rtp")));
    m_editor->show();
    QCoreApplication::processEvents();
}

EditorFile::~EditorFile() = default;

void EditorFile::load()
{
    m_editor->templateModel()->load(m_folder.filePath(QStringLiteral("bench.rtp")));
    QCoreApplication::processEvents();
}

int flowPieces(int pieces)
{
    QVector<int> heights;
    heights.reserve(pieces);
    for (int i = 0; i < pieces; ++i)
        heights.append(20 + i * 37 % 400);
    const auto content = [](int page) { return QRect(20, 1366 * page + 40, 952, 1306); };
    return KvPageFlow::place(heights, content).last().page + 1;
}

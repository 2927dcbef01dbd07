// SPDX-License-Identifier: MIT
#include "ValueTableCases.h"

#include "KvDeskTableView.h"
#include "KvDeskValueTableModel.h"
#include "TableFiles.h"
#include "kernel/ZtKernelData.h"
#include "kernel/ZtSignalCenter.h"
#include "measuring/ZtDrawnObjectData.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtImportedTable.h"
#include "measuring/ZtReadyObjects.h"
#include "measuring/ZtTableImport.h"

#include <QCoreApplication>
#include <QLineEdit>
#include <QScrollBar>

namespace {

ZtKernelData *kernel()
{
    return ZtKernelData::getInstance();
}

QPolygonF shape(int i)
{
    const double x = i % 997;
    const double y = i % 1009;
    return QVector<QPointF>{QPointF(x, y), QPointF(x + 3 + i % 89, y + 4)};
}

} // namespace

ValueTableCases::ValueTableCases()
    : m_session(&m_document)
    , m_editor(&m_session, &m_selection)
{
    m_table.setEditor(&m_editor);
    m_table.resize(416, 900);
    m_table.show();
    show();
}

ValueTableCases::ValueTableCases(int objects)
    : ValueTableCases()
{
    m_lines = objects / 2;
    {
        const ZtKernelData::SignalBlocker blocker;
        for (int i = 0; i < m_lines; ++i)
            kernel()->addObject(ZtDrawnType::Line, std::make_unique<ZtDrawnObjectData>(shape(i), QString()),
                                i + 1);
        for (int i = 0; i < objects - m_lines; ++i)
            kernel()->addObject(ZtDrawnType::Circle, std::make_unique<ZtDrawnObjectData>(shape(i), QString()),
                                i + 1);
    }
    m_document.setCalibration(ZtCalibration(0.5));
    reset();
    show();
}

void ValueTableCases::import(int objects)
{
    ZtImportedTable table;
    ZtFault fault;
    if (!ZtTableImport::parse(TableFiles::wideTable(objects), QString(), ZtTableImportOptions(), &table,
                              &fault))
        qFatal("The table is wrong");
    std::vector<ZtReadyObjects> ready = ZtReadyObjects::ofTable(table);
    m_document.addTable(&ready);
}

void ValueTableCases::follow()
{
    m_table.model()->flush();
}

void ValueTableCases::clear()
{
    m_document.clear();
    follow();
    show();
}

void ValueTableCases::removeImported()
{
    kernel()->removeObject(ZtTableImport::firstTypeId, ++m_removed);
}

void ValueTableCases::takeSession()
{
    m_document.toSession();
}

void ValueTableCases::reset()
{
    emit ZtSignalCenter::getInstance()->signalObjectCreated(ZtDrawnType::Line, 1,
                                                            kernel()->object(ZtDrawnType::Line, 1));
    emit ZtSignalCenter::getInstance()->signalLengthUnitChanged();
    m_table.model()->flush();
}

void ValueTableCases::show()
{
    m_table.view()->viewport()->update();
    for (int i = 0; i < 4; ++i)
        QCoreApplication::processEvents();
}

int ValueTableCases::rowCount() const
{
    return m_table.model()->rowCount();
}

int ValueTableCases::nextLine()
{
    m_step = (m_step + 7919) % m_lines;
    return m_step + 1;
}

void ValueTableCases::changeOne()
{
    const int id = nextLine();
    auto *const line = static_cast<ZtDrawnObjectData *>(kernel()->object(ZtDrawnType::Line, id));
    line->setPoints(QVector<QPointF>{QPointF(0, 0), QPointF(1 + m_step % 71, m_step % 97)});
    kernel()->notifyObjectChanged(ZtDrawnType::Line, id);
    m_table.model()->flush();
    show();
}

void ValueTableCases::addOne()
{
    m_added = m_document.addObject(ZtDrawnType::Line, shape(1));
    m_table.model()->flush();
    show();
}

void ValueTableCases::removeOne()
{
    kernel()->removeObject(ZtDrawnType::Line, m_added);
    m_table.model()->flush();
    show();
}

void ValueTableCases::selectOne()
{
    m_selection.select({ZtDrawnType::Line, nextLine()});
    show();
}

void ValueTableCases::selectAll()
{
    m_selection.clear();
    m_table.view()->selectAll();
    show();
}

void ValueTableCases::scroll()
{
    QScrollBar *const bar = m_table.view()->verticalScrollBar();
    bar->setValue(bar->value() + bar->pageStep() > bar->maximum() ? 0 : bar->value() + bar->pageStep());
    show();
}

void ValueTableCases::sort(int column)
{
    m_table.view()->sortByColumn(column, Qt::AscendingOrder);
    show();
}

void ValueTableCases::filter(const QString &text)
{
    m_table.filterField()->setText(text);
    if (text.isEmpty())
        m_table.slotClearFilter();
    else
        QMetaObject::invokeMethod(&m_table, "slotApplyFilter");
    show();
}

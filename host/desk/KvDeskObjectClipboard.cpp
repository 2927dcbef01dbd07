// SPDX-License-Identifier: MIT
#include "KvDeskObjectClipboard.h"

#include "KvDeskObjectState.h"
#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtSession.h"

#include <QMimeData>

#include <algorithm>

namespace {

const QChar separator = QLatin1Char('\t');

// Blanks in place of what would break the table.
QString cell(const QString &text)
{
    return text.simplified();
}

QVector<KvDeskObjectId> sorted(const QSet<KvDeskObjectId> &objects)
{
    QVector<KvDeskObjectId> result(objects.begin(), objects.end());
    std::sort(result.begin(), result.end());
    return result;
}

QString rowsOf(const KvDeskObjectId &object)
{
    const ZtGsManipulator *const manipulator = ZtKernelData::getInstance()->getGsManipulator(object.type);
    const ZtKernelObjectData *const data = ZtKernelData::getInstance()->object(object.type, object.id);
    if (!manipulator || !data)
        return QString();
    const QString start = cell(manipulator->objectTypeName(object.id)) + separator +
                          cell(manipulator->getObjectName(object.id)) + separator;
    QString rows;
    for (const QString &name : manipulator->valueSet(object.id)) {
        const QString text = manipulator->valueText(name, data);
        if (!text.isEmpty())
            rows += start + cell(name) + separator + cell(text) + QLatin1Char('\n');
    }
    return rows.isEmpty() ? start + separator + QLatin1Char('\n') : rows;
}

} // namespace

QString KvDeskObjectClipboard::mimeType()
{
    return QStringLiteral("application/x-measuringdesk-objects+json");
}

std::unique_ptr<QMimeData> KvDeskObjectClipboard::toMimeData(const QSet<KvDeskObjectId> &objects)
{
    auto data = std::make_unique<QMimeData>();
    const QVector<KvDeskObjectId> inOrder = sorted(objects);
    const QByteArray session = toSession(inOrder);
    if (!session.isEmpty())
        data->setData(mimeType(), session);
    data->setText(toTable(inOrder));
    return data;
}

QByteArray KvDeskObjectClipboard::toSession(const QVector<KvDeskObjectId> &objects)
{
    ZtSession session;
    for (const KvDeskObjectId &object : objects) {
        const KvDeskObjectState state = KvDeskObjectState::of(object);
        const ZtDrawnType *const type = ZtDrawnType::find(object.type);
        if (type && state.exists)
            session.objects.append(
                {type, object.id, state.name, state.text, state.points, state.hiddenValues});
    }
    return session.objects.isEmpty() ? QByteArray() : session.toJson(QString());
}

QString KvDeskObjectClipboard::toTable(const QVector<KvDeskObjectId> &objects)
{
    QString table = QStringList({tr("Type"), tr("Object"), tr("Value name"), tr("Value")}).join(separator) +
                    QLatin1Char('\n');
    for (const KvDeskObjectId &object : objects)
        table += rowsOf(object);
    return table;
}

bool KvDeskObjectClipboard::hasObjects(const QMimeData *data)
{
    return data && data->hasFormat(mimeType());
}

QVector<ZtSessionObject> KvDeskObjectClipboard::objects(const QMimeData *data)
{
    ZtSession session;
    ZtFault fault;
    if (!hasObjects(data) || !ZtSession::parse(data->data(mimeType()), QString(), &session, &fault))
        return {};
    return session.objects;
}

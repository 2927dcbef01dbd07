// SPDX-License-Identifier: MIT
#include "templates/KvBaseEditorNodeFactory.h"

#include "editor/KvEditorToolWidget.h"
#include "gui/acss.h"
#include "resources/KvReportResources.h"

#include <QDataStream>
#include <QMimeData>

const char KvBaseEditorNodeFactory::MimeFormat[] = "application/x-KvEditorToolsListModeldatalist";

namespace {
constexpr int kToolIconMode = 6;
constexpr int kToolIconExtent = 24;

QIcon toolIcon(const QString &path)
{
    KvReportResources::ensure();
    return acss::createIcon(kToolIconMode, path, QSize(kToolIconExtent, kToolIconExtent));
}
} // namespace

KvBaseEditorNodeFactory::KvBaseEditorNodeFactory(const QString &name, const QString &title,
                                                 const QString &iconPath)
    : m_name(name)
    , m_title(title)
    , m_icon(toolIcon(iconPath))
{}

KvBaseEditorNodeFactory::~KvBaseEditorNodeFactory()
{
    // Made for the drag picture alone and never put into a palette: nobody else would delete it.
    if (m_toolWidget && !m_toolWidget->parent())
        delete m_toolWidget;
}

KvEditorToolWidget *KvBaseEditorNodeFactory::toolWidget(QWidget *parent)
{
    if (!m_toolWidget) {
        m_toolWidget = new KvEditorToolWidget(this, parent);
        m_toolWidget->setText(m_title);
        m_toolWidget->setIcon(m_icon);
    }
    return m_toolWidget;
}

QPixmap KvBaseEditorNodeFactory::dragPixmap()
{
    if (m_preview.isNull()) {
        QWidget *widget = toolWidget(nullptr);
        m_preview = widget->grab();
    }
    return m_preview;
}

QMimeData *KvBaseEditorNodeFactory::mimeData() const
{
    QByteArray bytes;
    QDataStream stream(&bytes, QIODevice::WriteOnly);
    // Texts as QString: a const char* would be streamed in another form.
    stream << QStringLiteral("nodeType") << m_name;
    auto *data = new QMimeData;
    data->setData(QLatin1String(MimeFormat), bytes);
    return data;
}

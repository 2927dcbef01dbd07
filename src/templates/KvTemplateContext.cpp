// SPDX-License-Identifier: MIT
#include "templates/KvTemplateContext.h"

#include "data/KvReportKernelData.h"

#include <QJsonObject>

#include <algorithm>

namespace {

const char kPageWidthKey[] = "pageWidth";
const char kMarginWidthKey[] = "marginWidth";

// No window system makes larger windows, and to Qt the pieces of a page are such; a damaged file may ask for
// any width.
constexpr int kLargestExtent = 32767;
constexpr double kPageProportion = 1.4142;

} // namespace

KvTemplateContext::KvTemplateContext(KvReportKernelData *kernelData, QObject *parent)
    : QObject(parent)
    , m_kernelData(kernelData)
{}

bool KvTemplateContext::toJson(QJsonObject &config) const
{
    config[QLatin1String(kPageWidthKey)] = m_pageWidth;
    config[QLatin1String(kMarginWidthKey)] = static_cast<double>(m_marginWidth);
    return true;
}

bool KvTemplateContext::fromJson(const QJsonObject &config)
{
    if (config.contains(QLatin1String(kPageWidthKey)))
        m_pageWidth = config.value(QLatin1String(kPageWidthKey)).toInt();
    if (config.contains(QLatin1String(kMarginWidthKey)))
        m_marginWidth = static_cast<float>(config.value(QLatin1String(kMarginWidthKey)).toDouble());
    return true;
}

void KvTemplateContext::resetDefaults()
{
    m_pageWidth = DefaultPageWidth;
    m_contentHeight = DefaultContentHeight;
    m_marginWidth = DefaultMarginWidth;
}

void KvTemplateContext::beginLiveUpdates()
{
    m_liveUpdates = true;
    if (m_kernelData)
        m_kernelData->setActive(true);
}

void KvTemplateContext::endLiveUpdates()
{
    m_liveUpdates = false;
    if (m_kernelData)
        m_kernelData->setActive(false);
}

KvReportKernelData *KvTemplateContext::kernelData() const
{
    return m_kernelData;
}

void KvTemplateContext::setContentHeight(int height)
{
    if (height == m_contentHeight)
        return;
    m_contentHeight = height;
    emit signalContentHeightChanged();
}

int KvTemplateContext::layoutWidth() const
{
    return std::clamp(m_pageWidth, 0, kLargestExtent);
}

int KvTemplateContext::marginPixels() const
{
    // In single precision: 600 px x 0.12 is 72, which double arithmetic on the same fraction truncates to 71.
    const float margin = static_cast<float>(layoutWidth()) * m_marginWidth;
    if (!(margin >= 1.0f))
        return 0;
    return margin < static_cast<float>(kLargestExtent) ? static_cast<int>(margin) : kLargestExtent;
}

int KvTemplateContext::usableWidth() const
{
    return std::max(0, layoutWidth() - 2 * marginPixels());
}

int KvTemplateContext::pageHeight() const
{
    return static_cast<int>(layoutWidth() * kPageProportion);
}

// SPDX-License-Identifier: MIT
#include "report/KvNodeWrapperWidget.h"

#include "report/KvReportNode.h"
#include "templates/KvTemplateContext.h"
#include "ui_KvNodeWrapperWidgetUi.h"

KvNodeWrapperWidget::KvNodeWrapperWidget(KvReportNode *node, QWidget *piece)
    : m_ui(std::make_unique<Ui::KvNodeWrapperWidgetUi>())
    , m_node(node)
    , m_piece(piece)
{
    m_ui->setupUi(this);
    setLayoutDirection(Qt::LeftToRight);
    applyStyle();
    m_ui->contentVerticalLayout->addWidget(piece);
    piece->show();
}

void KvNodeWrapperWidget::applyStyle()
{
    // On paper a piece that paints all of itself needs no background from us. Style sheets are polished for
    // every widget below them, each time one gets a new parent: hundreds of pages would spend more on them
    // than on painting.
    if (m_node->context()->isPrinting() && m_piece->testAttribute(Qt::WA_OpaquePaintEvent)) {
        setAttribute(Qt::WA_OpaquePaintEvent);
        return;
    }
    setStyleSheet(QStringLiteral("QWidget { background: white; }"));
    const QString pieceStyle = QStringLiteral("QWidget { background: white; color: black;}");
    if (m_piece->styleSheet() != pieceStyle)
        m_piece->setStyleSheet(pieceStyle);
}

KvNodeWrapperWidget::~KvNodeWrapperWidget()
{
    if (QWidget *piece = this->piece())
        piece->setParent(nullptr);
}

QWidget *KvNodeWrapperWidget::piece() const
{
    // It moves on while a report is printed, and comes back with the next frame that is made for it.
    return m_piece && m_piece->parentWidget() == this ? m_piece.data() : nullptr;
}

void KvNodeWrapperWidget::setMargin(int pixels)
{
    if (m_ui->leftMargin->minimumWidth() == pixels && m_ui->leftMargin->maximumWidth() == pixels)
        return;
    m_ui->leftMargin->setFixedWidth(pixels);
    m_ui->rightMargin->setFixedWidth(pixels);
}

void KvNodeWrapperWidget::fitToPiece()
{
    ensurePolished();
    // The layout keeps the size that it was told last; not every piece tells it of another one.
    if (QWidget *piece = this->piece())
        piece->updateGeometry();
    layout()->activate();
    // Not adjustSize(): it would cap the frame, a window of its own, at two thirds of the screen.
    const QSize wanted = sizeHint();
    if (size() != wanted)
        resize(wanted);
}

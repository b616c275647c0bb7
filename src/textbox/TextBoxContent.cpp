// SPDX-License-Identifier: MIT
// What of a text box belongs to the picture of the drawing.
#include "textbox/TnTextBox.h"

#include <QAbstractTextDocumentLayout>
#include <QScrollBar>

namespace penwick {

void TnTextBox::drawContent(QPainter &painter)
{
    // Says nothing of a caret and of what is selected, and so neither is painted.
    QAbstractTextDocumentLayout::PaintContext context;
    context.palette = palette();
    const QPointF scrolled(horizontalScrollBar()->value(), verticalScrollBar()->value());
    context.clip = QRectF(scrolled, QSizeF(QWidget::size()));
    painter.translate(-scrolled);
    document()->documentLayout()->draw(&painter, context);
}

} // namespace penwick

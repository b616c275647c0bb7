// SPDX-License-Identifier: MIT
#include "session/PictureFit.h"

#include "platform/foundation/KeptShape.h"
#include "platform/view/ImageView.h"

#include <penwick/platform/Window.h>

#include <QEvent>

#include <utility>

namespace penwick {

namespace {

platform::Size sizeOf(const QSizeF &size)
{
    return { size.width(), size.height() };
}

} // namespace

PictureFit::PictureFit(platform::Window &window, platform::ImageView &view)
    : m_window(window)
    , m_view(view)
{
    delete view.findChild<PictureFit *>(QString(), Qt::FindDirectChildrenOnly); // another image's
    setParent(&view);
    window.installEventFilter(this);
    connect(&window, &platform::Window::frameSettled, this, &PictureFit::onSettled);
}

bool PictureFit::eventFilter(QObject *watched, QEvent *event)
{
    // Before the first paint, where the desktop tells the borders beforehand. Later on it may be
    // the user who resizes the window.
    if (event->type() == QEvent::Resize && !m_settled)
        fit();
    return QObject::eventFilter(watched, event);
}

void PictureFit::fit()
{
    const platform::Size size = platform::scaledDownInto(
        sizeOf(m_view.image().deviceIndependentSize()), sizeOf(m_window.size()));
    m_view.setFrame({ 0.0, 0.0, size.width, size.height });
}

void PictureFit::onSettled()
{
    const bool hasFrame = m_window.frameGeometry() != m_window.geometry();
    const auto former = std::exchange(m_settled, m_window.size());
    // A desktop that has told no borders beforehand may still add them later, inside the frame that
    // was asked for, and so make the content smaller. Where no borders ever come, the picture is
    // fitted until the user pulls at an edge.
    const bool isPulled = !hasFrame && former && *former != m_settled;
    if (!isPulled)
        fit();
    if (!hasFrame && !isPulled)
        return;
    m_window.removeEventFilter(this);
    disconnect(&m_window, nullptr, this, nullptr);
    deleteLater();
}

} // namespace penwick

// SPDX-License-Identifier: MIT
// How large the picture of an image window is.
#pragma once

#include <QObject>
#include <QSize>

#include <optional>

namespace penwick {

namespace platform {
class ImageView;
class Window;
} // namespace platform

/// Scales a window's picture down to what its content can hold, until the desktop has said how
/// large that is. From then on the picture keeps its scale: strokes stay on what they mark.
class PictureFit final : public QObject
{
    Q_OBJECT

public:
    /// Borrows `window`. `view` lies in `window`, has its image, and owns this object; a former
    /// PictureFit of `view` is deleted.
    PictureFit(platform::Window &window, platform::ImageView &view);

    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    void fit();
    void onSettled();

    platform::Window &m_window;
    platform::ImageView &m_view;
    std::optional<QSize> m_settled; // the content's size when the window's frame was last settled
};

} // namespace penwick

// SPDX-License-Identifier: MIT
// What a host opens drawing windows with.
#pragma once

#include <penwick/DrawingWindowController.h>
#include <penwick/Export.h>
#include <penwick/WindowType.h>

#include <QImage>
#include <QString>

#include <memory>
#include <optional>

class QScreen;

namespace penwick {

/// Posted on platform::NotificationCenter::defaultCenter() when a drawing window closes, by the
/// user or by the host. The object is a bool: true only for an imageAnnotation window. Not posted
/// when the host lets go of the window instead of closing it. Made once; any thread.
[[nodiscard]] PENWICK_EXPORT const QString &penwickSessionEndNotificationKey();

/// The component's entry object. It holds the controller of the drawing window that it opened
/// last, and with it the window: a second window replaces the first, and both leave the screen
/// with this object unless the host holds their controllers. Needs a QApplication, of which it
/// changes nothing. GUI thread only: on any other thread, and without a QApplication (a
/// QGuiApplication, which has no widgets, is not enough), each operation stops the process.
class PENWICK_EXPORT Penwick
{
public:
    Penwick();
    ~Penwick();
    Penwick(const Penwick &) = delete;
    Penwick &operator=(const Penwick &) = delete;

    /// The controller of the drawing window opened last; null before the first.
    [[nodiscard]] std::shared_ptr<DrawingWindowController> penwickWindowController() const;
    /// Holds `controller` in place of the one before, which is let go of: unless somebody else
    /// holds it, its window leaves the screen.
    void setPenwickWindowController(std::shared_ptr<DrawingWindowController> controller);

    /// Builds and places a drawing window, which the host then shows with showWindow().
    ///
    /// `drawScreen` must not be null: a null screen stops the process. `annotatedImage` and
    /// `windowTitle` are used by imageAnnotation windows only. One that is given no image, or a
    /// null one, has no tool bar, and keeps the frame that it was loaded with. Returns null, after
    /// printing "Not able to create Penwick WindowController!" to standard output, where the
    /// component's resources are damaged.
    std::shared_ptr<DrawingWindowController> createDrawingWindowController(WindowType windowType,
        QScreen *drawScreen, const std::optional<QImage> &annotatedImage = std::nullopt,
        const std::optional<QString> &windowTitle = std::nullopt);

    /// Shows for a moment, over the drawing window, that it is being shared. Without a drawing
    /// window nothing happens.
    void showWindowSharingNotification();

private:
    std::shared_ptr<DrawingWindowController> m_penwickWindowController;
};

} // namespace penwick

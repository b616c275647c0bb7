// SPDX-License-Identifier: MIT
// Frames and pictures that keep a shape: how large they become and where they stand.
#pragma once

#include <penwick/platform/Geometry.h>

namespace penwick::platform {

/// `frame` inside `area`: scaled down in its own shape where it is larger, then moved by as little
/// as brings it in.
[[nodiscard]] Rect broughtInsideInShape(const Rect &frame, const Rect &area);

/// The largest size in the shape of `picture` that `room` can hold, in whole points, at least one
/// each way; never larger than `picture`.
[[nodiscard]] Size scaledDownInto(const Size &picture, const Size &room);

/// The frame in the shape of `ratio` for one that the user has pulled from `before` to `pulled`. If
/// an edge was pulled outward, it is the smallest that holds `pulled`, so that no such pull makes a
/// window smaller; otherwise the largest that fits into `pulled`. Of the left and the right edge
/// the one that was not pulled stays, and the left one if neither or both were; likewise of the top
/// and the bottom edge, with the top one if neither or both were. A frame that would be larger than
/// `area` is brought inside it in its shape.
[[nodiscard]] Rect shapedAfterPull(
    const Rect &before, const Rect &pulled, const Size &ratio, const Rect &area);

/// Whether `frame` goes from edge to edge of `area`, one way at least, but for a desktop's border:
/// as a window that the desktop puts into a half of the screen does.
[[nodiscard]] bool spans(const Rect &frame, const Rect &area);

/// The largest frame in the shape of `ratio` inside `frame`, in its top left corner.
[[nodiscard]] Rect shapedInside(const Rect &frame, const Size &ratio);

} // namespace penwick::platform

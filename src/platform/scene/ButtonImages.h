// SPDX-License-Identifier: MIT
// The pictures of a scene's buttons.
#pragma once

namespace penwick::platform {

class Bundle;
class Button;

/// Gives `button` those of its two images from `bundle` that a scene has named.
void loadImages(Button &button, const Bundle &bundle);

} // namespace penwick::platform

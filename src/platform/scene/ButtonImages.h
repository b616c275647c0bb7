// SPDX-License-Identifier: MIT
// The pictures of a scene's buttons.
#pragma once

namespace penwick::platform {

class Bundle;
class Button;

/// Gives `button` its images from `bundle`, where a scene has named them.
void loadImages(Button &button, const Bundle &bundle);

} // namespace penwick::platform

// SPDX-License-Identifier: MIT
#include "platform/scene/ButtonImages.h"

#include "platform/scene/Bundle.h"
#include "platform/view/Button.h"

namespace penwick::platform {

void loadImages(Button &button, const Bundle &bundle)
{
    if (!button.imageName().isEmpty())
        button.setImage(bundle.imageForResource(button.imageName()));
    if (!button.alternateImageName().isEmpty())
        button.setAlternateImage(bundle.imageForResource(button.alternateImageName()));
}

} // namespace penwick::platform

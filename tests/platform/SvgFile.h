// SPDX-License-Identifier: MIT
// Artwork for tests, in a folder that goes with it.
#pragma once

#include "platform/scene/SvgIconEngine.h"

#include <QFile>
#include <QIcon>
#include <QTemporaryDir>

namespace penwick::platform {

/// An image of `width` x `height` points, called "Artwork": the left half red, the right half
/// empty, with a sharp edge between the two.
class SvgFile
{
public:
    SvgFile(int width, int height)
    {
        QFile file(path());
        if (!file.open(QIODevice::WriteOnly))
            qFatal("no folder for artwork");
        file.write(QStringLiteral("<svg xmlns=\"http://www.w3.org/2000/svg\" width=\"%1\" "
                                  "height=\"%2\" viewBox=\"0 0 %1 %2\"><rect width=\"%3\" "
                                  "height=\"%2\" fill=\"#ff0000\"/></svg>")
                       .arg(width)
                       .arg(height)
                       .arg(width / 2)
                       .toUtf8());
    }

    [[nodiscard]] QString folder() const { return m_folder.path(); }
    [[nodiscard]] QString path() const { return m_folder.filePath(QStringLiteral("Artwork.svg")); }
    [[nodiscard]] QIcon icon() const { return QIcon(new SvgIconEngine(path())); }

private:
    QTemporaryDir m_folder;
};

} // namespace penwick::platform

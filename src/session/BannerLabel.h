// SPDX-License-Identifier: MIT
// The words on the banner.
#pragma once

#include "platform/view/ViewOf.h"

#include <QFont>
#include <QString>
#include <QWidget>

namespace penwick {

/// One line of text in the middle, light with a dark outline: the banner is translucent, so any
/// colour may lie below it.
class BannerLabel final : public platform::ViewOf<QWidget>
{
    Q_OBJECT
    Q_PROPERTY(QString text READ text WRITE setText)

public:
    explicit BannerLabel(QWidget *parent = nullptr);

    [[nodiscard]] bool isFlipped() const override { return true; }

    [[nodiscard]] const QString &text() const { return m_text; }
    void setText(const QString &text);

    /// What the text needs, in points, its outline included.
    [[nodiscard]] double widthOfText() const;

    void draw(const platform::Rect &dirtyRect) override;

private:
    QFont m_font;
    QString m_text;
};

} // namespace penwick

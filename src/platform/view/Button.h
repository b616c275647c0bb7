// SPDX-License-Identifier: MIT
// A button that is all image, title and background, without the desktop's own look.
#pragma once

#include "platform/view/AttributedString.h"
#include "platform/view/FittedText.h"
#include "platform/view/ViewOf.h"

#include <QIcon>
#include <QPushButton>

#include <functional>
#include <optional>

namespace penwick::platform {

/// An image (or a title where there is none) in the middle of a coloured background. It never
/// takes the keys. Its own y axis points downwards, as text runs.
class Button : public ViewOf<QPushButton>
{
    Q_OBJECT
    /// The user-interface item identifier; empty where a scene gave none.
    Q_PROPERTY(QString identifier READ identifier WRITE setIdentifier)
    /// Names of the images in the bundle that the scene's images come from.
    Q_PROPERTY(QString imageName READ imageName WRITE setImageName)
    Q_PROPERTY(QString alternateImageName READ alternateImageName WRITE setAlternateImageName)

public:
    enum class State
    {
        Off = 0,
        On = 1
    };
    using Action = std::function<void(Button &)>;

    explicit Button(QWidget *parent = nullptr);

    [[nodiscard]] bool isFlipped() const override { return true; }

    [[nodiscard]] const QString &identifier() const { return m_identifier; }
    void setIdentifier(const QString &identifier) { m_identifier = identifier; }

    [[nodiscard]] const QString &imageName() const { return m_imageName; }
    void setImageName(const QString &name) { m_imageName = name; }
    [[nodiscard]] const QString &alternateImageName() const { return m_alternateImageName; }
    void setAlternateImageName(const QString &name) { m_alternateImageName = name; }

    /// Turned on by every press, before the action.
    [[nodiscard]] State state() const { return m_state; }
    void setState(State state) { m_state = state; }
    /// What a press does, by the pointer or through accessibility. While the pointer is held down
    /// on a view, a press through accessibility or the keys waits until it is let go.
    void setAction(Action action) { m_action = std::move(action); }

    [[nodiscard]] const QIcon &image() const { return m_image; }
    void setImage(const QIcon &image);
    /// Shown while the button is held down, if there is one.
    [[nodiscard]] const QIcon &alternateImage() const { return m_alternateImage; }
    void setAlternateImage(const QIcon &image);
    [[nodiscard]] const QColor &backgroundColor() const { return m_backgroundColor; }
    void setBackgroundColor(const QColor &color);
    [[nodiscard]] const AttributedString &attributedTitle() const { return m_attributedTitle; }
    /// A title that is too long for the button is shown smaller, or shortened, and whole in its
    /// tool tip.
    void setAttributedTitle(const AttributedString &title);

    void draw(const Rect &dirtyRect) override;
    [[nodiscard]] QSize sizeHint() const override;

protected:
    /// A disabled button does nothing when it is pressed, but ViewInput tells of the press.
    bool event(QEvent *event) override;
    /// The whole button can be pressed; a style may say that only a part of it can.
    [[nodiscard]] bool hitButton(const QPoint &position) const override;

private:
    void press();
    [[nodiscard]] FittedText fittedTitle() const;

    QString m_identifier;
    QString m_imageName;
    QString m_alternateImageName;
    State m_state = State::Off;
    Action m_action;
    QIcon m_image;
    QIcon m_alternateImage;
    QColor m_backgroundColor = Qt::transparent;
    AttributedString m_attributedTitle;
    std::optional<QString> m_ownToolTip; // while the title stands in its place
};

} // namespace penwick::platform

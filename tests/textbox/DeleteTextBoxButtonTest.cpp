// SPDX-License-Identifier: MIT
// The mark beside a text box: where it stands and what it looks like.
#include "textbox/DeleteTextBoxButton.h"

#include "platform/window/WindowContent.h"
#include "textbox/TextBoxFixture.h"

#include <QPainter>
#include <QSvgRenderer>

namespace penwick::test {
namespace {

const Rect boxFrame { 100, 100, 200, 40 };

/// A button in a window, with the artwork's names for what it shows.
class DeleteTextBoxButtonTest : public TextBoxFixture
{
protected:
    DeleteTextBoxButtonTest()
        : m_button(platform::makeView<DeleteTextBoxButton>(Rect { 20, 100, 200, 30 }))
    {
        canvas->addSubview(m_button);
        m_button->setHidden(false);
        settle();
    }

    static QImage artwork(const QString &name, double scale = 1.0)
    {
        QImage picture(QSize(20, 20) * scale, QImage::Format_ARGB32_Premultiplied);
        picture.fill(Qt::transparent);
        QPainter painter(&picture);
        QSvgRenderer(QStringLiteral(":/penwick/images/%1.svg").arg(name)).render(&painter);
        return picture;
    }

    static QImage shown(const QIcon &icon)
    {
        return icon.pixmap(20, 20).toImage().convertToFormat(QImage::Format_ARGB32_Premultiplied);
    }

    void enter()
    {
        QEnterEvent event({ 10, 10 }, { 10, 10 }, { 10, 10 });
        QCoreApplication::sendEvent(m_button.get(), &event);
    }
    void exit()
    {
        QEvent event(QEvent::Leave);
        QCoreApplication::sendEvent(m_button.get(), &event);
    }

    const QString m_normal = QStringLiteral("Delete_Text_Icon");
    const QString m_hover = QStringLiteral("Delete_Text_Icon_Hover");
    const std::shared_ptr<DeleteTextBoxButton> m_button;
};

TEST_F(DeleteTextBoxButtonTest, standsOutsideTheTopRightCornerOfItsBox)
{
    const auto button = platform::makeView<DeleteTextBoxButton>(boxFrame);

    EXPECT_EQ(button->frame(), (Rect { 301, 141, 20, 20 }));
    EXPECT_EQ(DeleteTextBoxButton::originFor(boxFrame), (Point { 301, 141 }));
}

TEST_F(DeleteTextBoxButtonTest, isHiddenAtFirstAndHasBothImages)
{
    const auto button = platform::makeView<DeleteTextBoxButton>(boxFrame);

    EXPECT_TRUE(button->isHidden());
    EXPECT_EQ(shown(button->image()), artwork(m_normal));
    EXPECT_EQ(shown(button->alternateImage()), artwork(m_hover));
    EXPECT_TRUE(button->tempImage().isNull());
    EXPECT_NE(artwork(m_normal), artwork(m_hover));
}

TEST_F(DeleteTextBoxButtonTest, saysWhatItDoes)
{
    EXPECT_EQ(m_button->accessibleName(), QStringLiteral("Delete text"));
    EXPECT_EQ(m_button->toolTip(), QStringLiteral("Delete text"));
}

TEST_F(DeleteTextBoxButtonTest, showsTheHoverImageWhileThePointerIsOverItAndTheArrow)
{
    enter();
    EXPECT_EQ(shown(m_button->image()), artwork(m_hover));
    EXPECT_EQ(shown(m_button->tempImage()), artwork(m_normal));
    EXPECT_EQ(platform::Cursor::currentCursor(), platform::Cursor::arrow());
    EXPECT_EQ(m_button->cursor().shape(), Qt::ArrowCursor);

    exit();
    EXPECT_EQ(shown(m_button->image()), artwork(m_normal));
}

TEST_F(DeleteTextBoxButtonTest, enteredTwiceWithoutALeaveItGoesBackToTheNormalImage)
{
    enter();
    enter();
    EXPECT_EQ(shown(m_button->image()), artwork(m_hover));
    EXPECT_EQ(shown(m_button->tempImage()), artwork(m_normal));

    exit();
    EXPECT_EQ(shown(m_button->image()), artwork(m_normal));
}

TEST_F(DeleteTextBoxButtonTest, imageThatIsGivenBetweenTwoHoversIsTheNormalOneFromThenOn)
{
    enter();
    exit();
    m_button->setImage(penwickBundle()->imageForResource(QStringLiteral("tool_text")));

    enter();
    exit();

    EXPECT_EQ(shown(m_button->image()), artwork(QStringLiteral("tool_text")));
}

TEST_F(DeleteTextBoxButtonTest, ofASceneHasNoImages)
{
    const DeleteTextBoxButton button;

    EXPECT_TRUE(button.tempImage().isNull());
    EXPECT_TRUE(button.image().isNull());
    EXPECT_FALSE(button.isHidden());
}

TEST_F(DeleteTextBoxButtonTest, cursorUpdateSetsTheArrow)
{
    const platform::Cursor brush(m_button->image(), { 0, 0 });
    brush.set(*m_button);

    m_button->cursorUpdate({});

    EXPECT_EQ(m_button->cursor().shape(), Qt::ArrowCursor);
    EXPECT_EQ(platform::Cursor::currentCursor(), platform::Cursor::arrow());
}

TEST_F(DeleteTextBoxButtonTest, keepsTheArrowWhileThePointerMovesOverIt)
{
    const platform::Cursor brush(m_button->image(), { 0, 0 });
    brush.set(*m_button);

    moveOver(*m_button, { 10, 10 });

    EXPECT_EQ(m_button->cursor().shape(), Qt::ArrowCursor);
}

TEST_F(DeleteTextBoxButtonTest, restoringBeforeAnyHoverKeepsTheImage)
{
    m_button->restoreImage();

    EXPECT_EQ(shown(m_button->image()), artwork(m_normal));
}

TEST_F(DeleteTextBoxButtonTest, isPaintedAsItsArtworkAndAsTheHoverOneUnderThePointer)
{
    const QRect place = m_button->geometry();
    const auto onWhite = [](const QImage &picture) {
        QImage result(picture.size(), QImage::Format_RGB32);
        result.fill(Qt::white);
        QPainter(&result).drawImage(0, 0, picture);
        return result;
    };

    const auto comesToShow = [&](const QString &name) {
        return QTest::qWaitFor([&] { return onScreen().copy(place) == onWhite(artwork(name)); });
    };

    EXPECT_TRUE(comesToShow(m_normal));
    enter();
    EXPECT_TRUE(comesToShow(m_hover));
    exit();
    EXPECT_TRUE(comesToShow(m_normal));
}

TEST_F(DeleteTextBoxButtonTest, artworkIsDrawnAnewForEveryScale)
{
    for (const double scale : { 1.0, 1.5, 2.0 }) {
        for (const QString &name : { m_normal, m_hover }) {
            const QIcon icon = penwickBundle()->imageForResource(name);
            const QPixmap pixmap = icon.pixmap(QSize(20, 20), scale);
            EXPECT_EQ(pixmap.size(), QSize(20, 20) * scale);
            QImage picture = pixmap.toImage().convertToFormat(QImage::Format_ARGB32_Premultiplied);
            picture.setDevicePixelRatio(1.0);
            EXPECT_EQ(picture, artwork(name, scale)) << name.toStdString() << " at " << scale;
        }
    }
}

TEST_F(DeleteTextBoxButtonTest, boxThatIsLeftByAKeyWhileItsButtonIsHoveredShowsTheNormalImageAgain)
{
    const auto box = newBox({ 20, 60 });
    QTest::keyClicks(box.get(), QStringLiteral("a"));
    DeleteTextBoxButton *const button = box->deleteTextButton();
    button->mouseEntered();
    ASSERT_EQ(shown(button->image()), artwork(m_hover));

    QTest::keyClick(box.get(), Qt::Key_Return);
    doubleClickOn(*box, { 20, 15 });

    ASSERT_FALSE(button->isHidden());
    EXPECT_EQ(shown(button->image()), artwork(m_normal));
}

TEST_F(DeleteTextBoxButtonTest, boxThatIsDeletedWhileItsButtonIsHoveredShowsTheNormalImageAgain)
{
    const auto box = newBox({ 20, 60 });
    QTest::keyClicks(box.get(), QStringLiteral("a"));
    DeleteTextBoxButton *const button = box->deleteTextButton();
    button->mouseEntered();

    clickOn(*button, { 10, 10 });

    EXPECT_EQ(shown(button->image()), artwork(m_normal));
}

TEST_F(DeleteTextBoxButtonTest, boxThatIsLeftWhileItsButtonIsHoveredShowsTheNormalImageNextTime)
{
    const auto box = newBox({ 20, 60 });
    QTest::keyClicks(box.get(), QStringLiteral("a"));
    DeleteTextBoxButton *const button = box->deleteTextButton();
    button->mouseEntered();
    leave();

    doubleClickOn(*box, { 20, 15 });
    EXPECT_EQ(shown(button->image()), artwork(m_normal));

    button->mouseEntered();
    button->mouseExited();
    EXPECT_EQ(shown(button->image()), artwork(m_normal));
}

TEST_F(DeleteTextBoxButtonTest, pressThatIsTakenAwayBeforeItIsReleasedDeletesNothing)
{
    const auto box = newBox({ 20, 60 });
    QTest::keyClicks(box.get(), QStringLiteral("a"));
    settle();

    pressOn(*box->deleteTextButton(), { 10, 10 });
    dragOn(*box->deleteTextButton(), { 60, 10 });
    releaseOn(*box->deleteTextButton(), { 60, 10 });

    EXPECT_EQ(box->superview(), canvas);
}

TEST_F(DeleteTextBoxButtonTest, otherButtonsDeleteNothing)
{
    const auto box = newBox({ 20, 60 });
    settle();

    clickOn(*box->deleteTextButton(), { 10, 10 }, Qt::RightButton);
    clickOn(*box->deleteTextButton(), { 10, 10 }, Qt::MiddleButton);

    EXPECT_EQ(box->superview(), canvas);
}

TEST_F(DeleteTextBoxButtonTest, pressDoesNotEndTheEditing)
{
    const auto box = newBox({ 20, 60 });
    settle();

    pressOn(*box->deleteTextButton(), { 10, 10 });

    EXPECT_EQ(contentOf(window).firstResponder(), box.get());
    EXPECT_TRUE(box->isEditable());
}

using DeleteTextBoxButtonDeathTest = TextBoxFixture;

TEST_F(DeleteTextBoxButtonDeathTest, missingBundleStopsTheProcess)
{
    setPenwickBundle(nullptr);

    EXPECT_DEATH(static_cast<void>(DeleteTextBoxButton(boxFrame)),
        "penwick: fatal error: the resource bundle is not set");
}

} // namespace
} // namespace penwick::test

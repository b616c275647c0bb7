// SPDX-License-Identifier: MIT
// Text boxes through the whole history with the canvas on the screen.
#include "platform/window/WindowContent.h"
#include "textbox/TextBoxFixture.h"

namespace penwick::test {
namespace {

using Views = std::vector<platform::View *>;

class TextBoxHistoryTest : public TextBoxFixture
{
protected:
    void choose(const QString &tool)
    {
        controller->handleToolSelection(tool);
        settle();
    }
    void undo() { choose(QStringLiteral("undo")); }
    void redo() { choose(QStringLiteral("redo")); }
    void clear() { choose(QStringLiteral("clear")); }

    /// The text boxes that are on the canvas, the lowest first.
    [[nodiscard]] Views boxes() const
    {
        Views found;
        for (platform::View *const view : canvas->subviews()) {
            if (dynamic_cast<TnTextBox *>(view))
                found.push_back(view);
        }
        return found;
    }

    /// How many delete buttons can be seen.
    [[nodiscard]] int visibleButtons() const
    {
        int count = 0;
        for (platform::View *const view : canvas->subviews())
            count += dynamic_cast<DeleteTextBoxButton *>(view) && view->widget().isVisible();
        return count;
    }

    const QString m_hello = QStringLiteral("Hello");
};

TEST_F(TextBoxHistoryTest, undoAndRedoOfANewBoxTakeItAwayAndBringTheSameOneBackWithItsText)
{
    const auto box = placedBox();
    const Rect frame = box->frame();

    undo();
    EXPECT_EQ(boxes(), Views {});
    EXPECT_EQ(visibleButtons(), 0);

    redo();
    EXPECT_EQ(boxes(), Views { box.get() });
    EXPECT_EQ(model().textBoxArray().last().textBox, box);
    EXPECT_EQ(box->toPlainText(), m_hello);
    EXPECT_EQ(box->frame(), frame);
    EXPECT_FALSE(box->isEditable());
    EXPECT_TRUE(box->widget().isVisible());
    EXPECT_EQ(visibleButtons(), 0);
}

TEST_F(TextBoxHistoryTest, undoWhileANewBoxIsEditedPlacesItAndTakesItAway)
{
    const auto box = newBox();
    QTest::keyClicks(box.get(), m_hello);

    undo();
    EXPECT_EQ(boxes(), Views {});
    EXPECT_EQ(visibleButtons(), 0);
    EXPECT_EQ(history().undoStack().size(), 0);
    EXPECT_EQ(history().redoStack().size(), 1);

    redo();
    EXPECT_EQ(boxes(), Views { box.get() });
    EXPECT_EQ(box->toPlainText(), m_hello);
    EXPECT_FALSE(box->isEditable());
}

TEST_F(TextBoxHistoryTest, undoWhileAnEmptyBoxIsEditedTakesItAwayAndRedoBringsItBack)
{
    const auto box = newBox();

    undo();
    EXPECT_EQ(boxes(), Views {});
    EXPECT_EQ(visibleButtons(), 0);
    EXPECT_EQ(history().undoStack().size(), 0);

    redo();
    EXPECT_EQ(boxes(), Views { box.get() });
    EXPECT_FALSE(box->isTextBoxDeleted());
}

TEST_F(TextBoxHistoryTest, boxErasedByItsButtonComesBackPlacedAndGoesAgain)
{
    const auto box = newBox();
    QTest::keyClicks(box.get(), m_hello);
    settle();

    clickOn(*box->deleteTextButton(), { 10, 10 });
    settle();
    EXPECT_EQ(boxes(), Views {});
    EXPECT_EQ(visibleButtons(), 0);
    EXPECT_EQ(history().undoStack().size(), 2);

    undo();
    EXPECT_EQ(boxes(), Views { box.get() });
    EXPECT_EQ(box->toPlainText(), m_hello);
    EXPECT_FALSE(box->isEditable());
    EXPECT_EQ(visibleButtons(), 0);

    redo();
    EXPECT_EQ(boxes(), Views {});
    EXPECT_TRUE(model().textBoxArray().isEmpty());
}

TEST_F(TextBoxHistoryTest, boxErasedByBackspaceComesBack)
{
    const auto box = placedBox();
    clickOn(*box, { 50, 15 });

    QTest::keyClick(box.get(), Qt::Key_Backspace);
    settle();
    EXPECT_EQ(boxes(), Views {});
    EXPECT_EQ(contentOf(window).firstResponder(), canvas);

    undo();
    EXPECT_EQ(boxes(), Views { box.get() });
    EXPECT_EQ(box->toPlainText(), m_hello);
}

TEST_F(TextBoxHistoryTest, boxLeftEmptyComesBackAndCanBeEditedAndLeftEmptyAgain)
{
    const auto box = newBox();
    leave();
    ASSERT_EQ(boxes(), Views {});
    EXPECT_EQ(history().undoStack().size(), 2);

    undo();
    EXPECT_EQ(boxes(), Views { box.get() });
    EXPECT_FALSE(box->isTextBoxDeleted());

    doubleClickOn(*box, { 20, 15 });
    settle();
    EXPECT_EQ(visibleButtons(), 1);
    leave();
    EXPECT_EQ(boxes(), Views {});
    EXPECT_EQ(visibleButtons(), 0);
    EXPECT_TRUE(model().textBoxArray().isEmpty());
}

TEST_F(TextBoxHistoryTest, boxLeftEmptyComesBackAndCanBeWrittenIn)
{
    const auto box = newBox();
    leave();
    undo();

    doubleClickOn(*box, { 20, 15 });
    QTest::keyClicks(box.get(), m_hello);
    leave();

    EXPECT_EQ(boxes(), Views { box.get() });
    EXPECT_EQ(box->toPlainText(), m_hello);
}

TEST_F(TextBoxHistoryTest, boxEmptiedLaterComesBackWithWhatItHadWhenItWasLeft)
{
    const auto box = placedBox();
    doubleClickOn(*box, { 20, 15 });
    box->selectAll();
    QTest::keyClick(box.get(), Qt::Key_Delete);
    leave();
    ASSERT_EQ(boxes(), Views {});

    undo();

    EXPECT_EQ(boxes(), Views { box.get() });
    EXPECT_EQ(box->toPlainText(), QString());
}

TEST_F(TextBoxHistoryTest, undoOfAClearBringsBackTheSameBoxesInReverse)
{
    const auto one = placedBox({ 20, 60 });
    const auto other = placedBox({ 20, 150 }, QStringLiteral("Bye"));

    clear();
    EXPECT_EQ(canvas->subviews(), Views {});
    EXPECT_TRUE(model().textBoxArray().isEmpty());

    undo();
    EXPECT_EQ(boxes(), (Views { other.get(), one.get() }));
    EXPECT_EQ(one->toPlainText(), m_hello);
    EXPECT_EQ(other->toPlainText(), QStringLiteral("Bye"));
    EXPECT_EQ(visibleButtons(), 0);

    redo();
    EXPECT_EQ(boxes(), Views {});
}

TEST_F(TextBoxHistoryTest, clearWhileABoxIsEditedPlacesItFirst)
{
    const auto box = newBox();
    QTest::keyClicks(box.get(), m_hello);

    clear();
    EXPECT_EQ(canvas->subviews(), Views {});
    EXPECT_EQ(visibleButtons(), 0);
    EXPECT_EQ(history().undoStack().size(), 1);

    undo();
    EXPECT_EQ(boxes(), Views { box.get() });
    EXPECT_EQ(box->toPlainText(), m_hello);
    EXPECT_FALSE(box->isEditable());
    EXPECT_EQ(visibleButtons(), 0);
}

TEST_F(TextBoxHistoryTest, clearWhileAnEmptyBoxIsEditedDeletesItSoThatTheClearHasNothingOfIt)
{
    newBox();

    clear();

    EXPECT_EQ(canvas->subviews(), Views {});
    EXPECT_TRUE(history().undoStack().isEmpty());
    undo();
    EXPECT_EQ(boxes(), Views {});
}

TEST_F(TextBoxHistoryTest, hiddenDeleteButtonThatIsLeftBehindLetsClearClear)
{
    const auto box = placedBox();
    undo();
    ASSERT_EQ(canvas->subviews(), Views { box->deleteTextButton() });
    ASSERT_EQ(visibleButtons(), 0);

    clear();

    EXPECT_EQ(canvas->subviews(), Views {});
    EXPECT_TRUE(history().redoStack().isEmpty());
}

TEST_F(TextBoxHistoryTest, redoOfAClearAfterABoxWasAddedTakesTheNewBoxOutOfTheModelByPosition)
{
    const auto cleared = placedBox({ 20, 60 });
    clear();
    undo();
    const auto added = placedBox({ 20, 150 }, QStringLiteral("new"));
    ASSERT_EQ(boxes(), (Views { cleared.get(), added.get() }));

    undo(); // of the new box, so that the clear is on top again
    redo(); // the new box comes back, after the cleared one
    ASSERT_EQ(idsOf(model().textBoxArray()), (Ids { cleared->hash(), added->hash() }));
    redo();

    // Redo takes the last box out of the model, which is the added one, but names the cleared one.
    // The cleared box's view goes and comes back with the next repaint, because the model still has
    // the box. The added box's view stays behind.
    EXPECT_EQ(idsOf(model().textBoxArray()), Ids { cleared->hash() });
    EXPECT_EQ(boxes(), (Views { added.get(), cleared.get() }));
}

TEST_F(TextBoxHistoryTest, boxErasedAndUndoneSeveralTimesStaysTheSameBox)
{
    const auto box = placedBox();

    for (int round = 0; round < 3; ++round) {
        box->deleteTextBox();
        settle();
        EXPECT_EQ(boxes(), Views {});
        undo();
        EXPECT_EQ(boxes(), Views { box.get() });
    }

    EXPECT_EQ(idsOf(model().textBoxArray()), Ids { box->hash() });
}

TEST_F(TextBoxHistoryTest, undoOfAStrokeGoesOnWithTheEditing)
{
    const auto box = placedBox();
    stroke({ { 50, 20 }, { 100, 20 } });
    doubleClickOn(*box, { 20, 15 });

    undo();

    EXPECT_TRUE(model().pathArray().isEmpty());
    EXPECT_TRUE(box->isEditable());
    EXPECT_EQ(contentOf(window).firstResponder(), box.get());
    EXPECT_EQ(visibleButtons(), 1);
}

TEST_F(TextBoxHistoryTest, boxIsGoneForGoodOnceNothingHoldsIt)
{
    std::weak_ptr<TnTextBox> box = placedBox();
    undo();
    stroke({ { 50, 20 }, { 100, 20 } }); // nothing can be redone any more
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);

    EXPECT_TRUE(box.expired());
    clear();
    EXPECT_EQ(canvas->subviews(), Views {});
}

} // namespace
} // namespace penwick::test

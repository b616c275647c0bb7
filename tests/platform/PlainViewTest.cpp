// SPDX-License-Identifier: MIT
// A view that only groups others.
#include "platform/view/PlainView.h"

#include "platform/ViewFixture.h"

#include <QImage>

namespace penwick::platform {

namespace {

/// A plain view in the content, with room for others in it.
class PlainViewTest : public ViewFixture
{
protected:
    PlainViewTest()
    {
        m_view->setFrame({ 10.0, 10.0, 100.0, 50.0 });
        m_content.addSubview(m_view);
    }

    const std::shared_ptr<PlainView> m_view = makeView<PlainView>();
};

} // namespace

TEST_F(PlainViewTest, leavesThePointerToTheViewAroundIt)
{
    QTest::mousePress(m_view.get(), Qt::LeftButton, Qt::NoModifier, QPoint(5, 5));
    QTest::mouseRelease(m_view.get(), Qt::LeftButton, Qt::NoModifier, QPoint(5, 5));

    EXPECT_EQ(m_content.take(), (Log { "down 15,55 x1", "up 15,55 x1" }));
}

TEST_F(PlainViewTest, leavesADoubleClickToTheViewAroundIt)
{
    QMouseEvent click(QEvent::MouseButtonDblClick, QPointF(5, 5),
        m_view->mapToGlobal(QPointF(5, 5)), Qt::LeftButton, Qt::LeftButton, Qt::NoModifier);

    QCoreApplication::sendEvent(m_view.get(), &click);

    EXPECT_EQ(m_content.take(), Log { "down 15,55 x2" });
}

TEST_F(PlainViewTest, showsItsLayerAndItsSubviews)
{
    m_view->setWantsLayer(true);
    m_view->layer()->backgroundColor = Qt::yellow;
    const auto inner = makeView<PlainView>();
    inner->setWantsLayer(true);
    inner->layer()->backgroundColor = Qt::red;
    inner->setFrame({ 0.0, 0.0, 20.0, 10.0 });
    m_view->addSubview(inner);

    const QImage picture = m_view->grab().toImage();

    EXPECT_EQ(picture.pixelColor(50, 5), QColor(Qt::yellow));
    EXPECT_EQ(picture.pixelColor(5, 45), QColor(Qt::red));
    EXPECT_EQ(m_view->subviews(), std::vector<View *> { inner.get() });
}

TEST_F(PlainViewTest, paintsNothingOfItsOwn)
{
    EXPECT_EQ(m_view->layer(), nullptr);
    QImage picture(100, 50, QImage::Format_RGB32);
    picture.fill(Qt::green);

    m_view->QWidget::render(&picture, QPoint(), QRegion(), QWidget::RenderFlags());

    EXPECT_EQ(picture.pixelColor(50, 25), QColor(Qt::green));
}

} // namespace penwick::platform

// SPDX-License-Identifier: MIT
#include "soak/PlainCanvas.h"

#include <algorithm>
#include <cmath>
#include <utility>

namespace penwick::test {

namespace {

constexpr double dragDistance = 10; // the toolkit's, where no desktop says otherwise

} // namespace

// The pointer on the canvas

void PlainCanvas::press(Spot spot)
{
    m_pressedAt = spot;
    m_cameFrom = spot;
    m_isFar = false;
    if (currentTool != "brush")
        return;
    makeFirstResponder("canvas");
    m_start = spot;
    m_drawing.beginStroke(spot, std::stod(thickness));
}

void PlainCanvas::drag(Spot spot)
{
    m_isFar = m_isFar
        || std::abs(spot.x - m_pressedAt.x) + std::abs(spot.y - m_pressedAt.y) >= dragDistance;
    if (currentTool == "text" && !m_isFar)
        return;
    makeFirstResponder("canvas");
    if (currentTool == "brush") {
        m_isDragged = true;
        m_drawing.extendStroke(spot);
        copyContent();
        m_start = spot;
    } else if (currentTool == "eraser") {
        eraseUpTo(spot);
        erase(spot);
    }
}

void PlainCanvas::release(Spot spot)
{
    if (currentTool == "brush") {
        if (m_start == spot && !m_isDragged) {
            if (!strokes.empty()) {
                strokes.pop_back();
                m_hasDropped = true;
            }
        } else {
            m_isDragged = false;
        }
    } else if (currentTool == "eraser") {
        eraseUpTo(spot);
        erase(spot);
    } else if (currentTool == "text") {
        placeBox(spot);
    }
}

void PlainCanvas::erase(Spot spot)
{
    if (m_drawing.eraseAt(spot))
        copyContent();
}

void PlainCanvas::eraseUpTo(Spot spot)
{
    for (const Spot &met : m_drawing.metBetween(m_cameFrom, spot))
        erase(met);
    m_cameFrom = spot;
}

void PlainCanvas::placeBox(Spot spot)
{
    if (m_responder != "canvas") {
        makeFirstResponder("canvas");
        return;
    }
    const std::string name = m_drawing.addBox();
    PlainBox &box = allBoxes[name];
    box.x = spot.x;
    box.top = spot.y - 24 + 30;
    if (spot.x < 0 || spot.x >= m_size.x || spot.y < 0 || spot.y > m_size.y)
        bringIntoReach(box);
    copyContent();
    putOn(name);
    makeFirstResponder(name);
}

// The pointer on a box

void PlainCanvas::pressBox(const std::string &name, Spot spot, int clickCount)
{
    PlainBox &box = allBoxes.at(name);
    if (clickCount == 1 && !box.isEditable) {
        box.hasDashedBorder = false;
    } else if (clickCount == 2) {
        if (!box.isEditable)
            box.text.begin();
        box.isEditable = true;
        box.hasDashedBorder = true;
        showButton(name);
    }
    makeFirstResponder(name);
    box.text.commit(); // a press is not for the input method
    m_canPan = !box.isEditable;
    m_isPanning = false;
    m_pressed = spot;
    m_grabbed = { box.x, box.top };
}

void PlainCanvas::dragBox(const std::string &name, Spot spot)
{
    allBoxes.at(name).text.commit();
    if (!m_canPan)
        return;
    const Spot way { spot.x - m_pressed.x, spot.y - m_pressed.y };
    m_isPanning = m_isPanning || std::hypot(way.x, way.y) >= 3;
    if (!m_isPanning)
        return;
    allBoxes.at(name).x = m_grabbed.x + way.x;
    allBoxes.at(name).top = m_grabbed.y + way.y;
}

void PlainCanvas::releaseBox(const std::string &name, Spot spot)
{
    if (m_isPanning) {
        dragBox(name, spot);
        bringIntoReach(allBoxes.at(name));
    }
    m_canPan = false;
    m_isPanning = false;
    makeFirstResponder(name);
}

void PlainCanvas::bringIntoReach(PlainBox &box) const
{
    const auto reaching = [](double place, double length, double end) {
        return std::max(20 - length, std::min(place, end - 20));
    };
    box.x = reaching(box.x, box.size.x, m_size.x);
    box.top = reaching(box.top - box.size.y, box.size.y, m_size.y) + box.size.y;
}

void PlainCanvas::adoptFrame(const std::string &name, Spot corner, Spot boxSize, Spot canvasSize)
{
    PlainBox &box = allBoxes.at(name);
    const bool isResized = m_wasResized || !(canvasSize == m_size);
    const bool mayMove = box.text.wasTouched() || (isResized && box.isEditable);
    box.size = boxSize;
    const bool isInSight = corner.x >= 0 && corner.y <= canvasSize.y
        && corner.x + boxSize.x <= canvasSize.x && corner.y - boxSize.y >= 0;
    if (mayMove && isInSight) {
        box.x = corner.x;
        box.top = corner.y;
    }
}

// Keys

std::string PlainCanvas::editedBox() const
{
    const auto found = allBoxes.find(m_responder);
    return found != allBoxes.end() && found->second.isEditable ? m_responder : std::string();
}

void PlainCanvas::type(const std::string &letter)
{
    allBoxes.at(m_responder).text.append(letter);
}

void PlainCanvas::backspace()
{
    if (!editedBox().empty())
        allBoxes.at(m_responder).text.backspace();
    else
        releaseBackspace();
}

void PlainCanvas::releaseBackspace()
{
    const std::string name = m_responder; // which changes as it goes
    if (allBoxes.count(name) && !allBoxes.at(name).isEditable)
        removeAndReport(name);
}

// First responder

void PlainCanvas::makeFirstResponder(const std::string &who)
{
    if (who == m_responder)
        return;
    const std::string before = m_responder;
    m_responder.clear();
    if (allBoxes.count(before))
        resign(before);
    if (!who.empty() || m_responder.empty())
        m_responder = who == "canvas" || isOnCanvas(who) ? who : std::string();
}

void PlainCanvas::resign(const std::string &name)
{
    PlainBox &box = allBoxes.at(name);
    if (box.isDeleted)
        return;
    box.text.commit();
    box.isEditable = false;
    box.hasDashedBorder = false;
    box.isButtonShown = false;
    viewHidden("x" + name.substr(1));
    if (box.text.isEmpty()) {
        box.isDeleted = true;
        leave(name);
        report(name);
    }
}

void PlainCanvas::leave(const std::string &name)
{
    if (m_responder == name)
        makeFirstResponder("");
    PlainBox &box = allBoxes.at(name);
    if (!box.isOnCanvas)
        return;
    box.isOnCanvas = false;
    std::erase(views, name);
    viewHidden(name);
}

void PlainCanvas::report(const std::string &name)
{
    m_drawing.deleteBox(name);
    makeFirstResponder("canvas");
    copyContent();
}

void PlainCanvas::removeAndReport(const std::string &name)
{
    const bool wasDeleted = allBoxes.at(name).isDeleted;
    leave(name);
    if (wasDeleted || !allBoxes.at(name).isDeleted)
        report(name);
}

// Views

bool PlainCanvas::isOnCanvas(const std::string &view) const
{
    return std::find(views.begin(), views.end(), view) != views.end();
}

void PlainCanvas::putOn(const std::string &name)
{
    PlainBox &box = allBoxes.at(name);
    if (box.isOnCanvas)
        return;
    box.isOnCanvas = true;
    box.isDeleted = false;
    views.push_back(name);
}

void PlainCanvas::showButton(const std::string &name)
{
    const std::string button = "x" + name.substr(1);
    allBoxes.at(name).isButtonShown = true;
    if (allBoxes.at(name).isOnCanvas && !isOnCanvas(button))
        views.push_back(button);
}

void PlainCanvas::paint()
{
    m_isPainted = true;
    turn(); // painting takes the content anew, so that no earlier stroke is missing
    for (const std::string &name : boxes)
        putOn(name);
    for (const std::string &view : std::vector(views)) {
        if (allBoxes.count(view) && allBoxes.at(view).hasDashedBorder)
            showButton(view);
    }
}

// Where a box has moved, the canvas below it is painted too, and then takes the content anew.
void PlainCanvas::adoptShown(std::size_t count)
{
    if (std::exchange(m_isPainted, false) && m_hasDropped && count == m_drawing.strokes().size())
        copyContent();
}

void PlainCanvas::turn()
{
    if (m_hasDropped)
        copyContent();
}

void PlainCanvas::takeOff(const std::string &box)
{
    if (isOnCanvas(box))
        leave(box);
}

void PlainCanvas::copyContent()
{
    strokes = m_drawing.strokes();
    boxes = m_drawing.boxes();
    m_hasDropped = false;
}

// Tools

void PlainCanvas::chooseTool(const std::string &tool)
{
    currentTool = tool;
    if (tool == "text")
        makeFirstResponder("canvas");
    if (tool == "text" || tool == "brush" || tool == "eraser")
        lastTool = tool;
    if (tool == "clear")
        clear();
    if (tool == "undo")
        m_drawing.undo();
    if (tool == "redo")
        m_drawing.redo();
    currentTool = lastTool;
}

void PlainCanvas::clear()
{
    if (strokes.empty() && boxes.empty() && views.empty())
        return;
    for (const std::string &view : std::vector(views)) {
        if (view.front() == 'x')
            std::erase(views, view);
        else
            leave(view);
    }
    m_drawing.clear();
    copyContent();
}

void PlainCanvas::chooseOption(const std::string &kind, const std::string &value)
{
    if (kind == "color") {
        color = value;
        currentTool = lastTool;
    } else if (kind == "brush") {
        thickness = value;
    } else {
        fontSize = value;
    }
}

} // namespace penwick::test

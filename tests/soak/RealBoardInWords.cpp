// SPDX-License-Identifier: MIT
// The component's state in the words of the second model.
#include "soak/RealBoard.h"

#include "appearance/Theme.h"
#include "canvas/DrawViewController.h"
#include "canvas/DrawingCanvasModel.h"
#include "canvas/DrawingCanvasView.h"
#include "history/UndoRedoManager.h"
#include "platform/window/WindowContent.h"
#include "session/ToolPanelWindowController.h"
#include "soak/PlainBoard.h"
#include "textbox/DeleteTextBoxButton.h"
#include "textbox/TnTextBox.h"
#include "toolpanel/PopoverView.h"
#include "toolpanel/PopoverViewController.h"
#include "toolpanel/ToolOptionsButton.h"
#include "toolpanel/ToolPanelButton.h"
#include "toolpanel/ToolPanelViewController.h"

#include <cmath>

namespace penwick::test {

namespace {

const EntryList<StrokeEntry> &strokesOf(const DrawingCanvasModel &model)
{
    return model.pathArray();
}

} // namespace

// Whatever is new is in its array when the first notification of it is posted.
void RealBoard::learnNames()
{
    if (!m_controller)
        return;
    const DrawingCanvasModel &model = *controller().drawingCanvasModel();
    for (const StrokeEntry &entry : strokesOf(model)) {
        if (!m_names.count(entry.pathId))
            m_names[entry.pathId] = "s" + std::to_string(++m_strokes);
    }
    for (const TextBoxEntry &entry : model.textBoxArray()) {
        if (m_names.count(entry.textId))
            continue;
        const std::string number = std::to_string(++m_boxes);
        m_names[entry.textId] = "b" + number;
        m_deleteButtons[entry.textBox->deleteTextButton()] = "x" + number;
    }
}

// A stroke or box that learnNames() has not seen is called "?", which shows as a difference.
std::string RealBoard::nameOf(std::int64_t id) const
{
    const auto found = m_names.find(id);
    return found == m_names.end() ? "?" : found->second;
}

std::string RealBoard::nameOf(platform::View *view) const
{
    if (!view)
        return "";
    if (view == static_cast<platform::View *>(&canvas()))
        return "canvas";
    if (auto *const button = dynamic_cast<DeleteTextBoxButton *>(view)) {
        const auto found = m_deleteButtons.find(button);
        return found == m_deleteButtons.end() ? "x?" : found->second;
    }
    return nameOf(view->hash());
}

std::string RealBoard::viewsInWords() const
{
    std::string words;
    for (platform::View *const view : canvas().subviews()) {
        words += " " + nameOf(view);
        if (const auto *const box = dynamic_cast<TnTextBox *>(view)) {
            const std::string composed = composedIn(nameOf(view));
            words += box->isEditable() ? ":edited:" : ":placed:";
            words += inOneLine(textOf(nameOf(view)))
                + (composed.empty() ? "" : "[" + inOneLine(composed) + "]") + "@"
                + std::to_string(static_cast<int>(box->frame().x)) + ","
                + std::to_string(static_cast<int>(box->frame().maxY()));
        } else {
            words += view->isHidden() ? "-" : "";
        }
    }
    return words;
}

std::string RealBoard::panelInWords() const
{
    std::string words = "buttons";
    for (const std::string &name : toolNames()) {
        const ToolPanelButton &button = *bar().button(QString::fromStdString(name));
        words += " " + name + (button.isSelected() ? "*" : "") + (button.isEnabled() ? "" : "-");
    }
    words += "\noptions";
    PopoverViewController &popovers = *bar().popoverVc();
    for (PopoverView *const popover :
        { popovers.textPopoverView(), popovers.colorPopoverView(), popovers.brushPopoverView() }) {
        for (platform::View *const view : popover->subviews().at(0)->subviews()) {
            const auto &option = dynamic_cast<ToolOptionsButton &>(*view);
            if (option.isSelected())
                words += " " + option.identifier().toStdString();
        }
    }
    words += "\npopover ";
    if (bar().popoverW()->isVisible()) {
        const auto *const first = dynamic_cast<ToolOptionsButton *>(
            contentOf(*bar().popoverW()).contentView()->subviews().at(0)->subviews().at(0));
        words += first->identifier().section(QLatin1Char('#'), 0, 0).toStdString();
    }
    return words;
}

std::string RealBoard::inWords()
{
    learnNames();
    std::string posted;
    for (const std::string &line : m_recorder->take()) {
        const std::string removal = "removeWithId ";
        if (line.starts_with(removal))
            posted += " " + removal + nameOf(std::stoll(line.substr(removal.size())));
        else
            posted += line.ends_with(".session.end") ? " end" : " " + line;
    }
    return inWords(posted);
}

std::string RealBoard::inWords(const std::string &posted) const
{
    const DrawingCanvasView &view = canvas();
    const DrawingCanvasModel &model = *controller().drawingCanvasModel();
    const UndoRedoManager &history = *model.undoRedoManager();
    const auto stack = [this](const RecordStack &records) {
        static const char *const actions[] = { "draw", "erase", "clear", "undo", "redo" };
        std::string words;
        for (const UndoRedoState &record : records) {
            words += std::string(" ") + actions[static_cast<int>(record.actionAssociated)] + " "
                + nameOf(record.elementId) + ",";
        }
        return words;
    };
    std::string words = "strokes";
    for (const StrokeEntry &entry : strokesOf(model))
        words += " " + nameOf(entry.pathId) + ":" + std::to_string(entry.bPath->elementCount() / 2);
    words += "\nboxes";
    for (const TextBoxEntry &entry : model.textBoxArray())
        words += " " + nameOf(entry.textId);
    words += "\nshown strokes";
    for (const StrokeEntry &entry : view.pathArray())
        words += " " + nameOf(entry.pathId);
    words += "\nshown boxes";
    for (const TextBoxEntry &entry : view.textBoxArray())
        words += " " + nameOf(entry.textId);
    words += "\nundo" + stack(history.undoStack()) + "\nredo" + stack(history.redoStack());
    words += "\ncount " + std::to_string(history.undoCount()) + "\nviews" + viewsInWords();
    words += "\nresponder " + nameOf(contentOf(window()).firstResponder());
    words += "\ntool " + view.currentSelectedTool().toStdString() + " after "
        + view.lastSelecedTool().toStdString();
    words += "\ncolor " + colorMap().key(view.brushColor()).toStdString() + " thickness "
        + std::to_string(static_cast<int>(view.brushThickness())) + " size "
        + std::to_string(static_cast<int>(view.textFontSize()));
    words += "\n" + panelInWords() + "\nwindows";
    words += window().isVisible() ? " drawing" : "";
    words += m_controller->tPanelWindowController()->window()->isVisible() ? " panel" : "";
    words += m_controller->sharingNotificationWindow()->isVisible() ? " banner" : "";
    words += "\nframes" + frames().inWords() + "\nmenu " + menu() + "\nclipboard "
        + inOneLine(clipboard());
    return words + "\nposted" + posted + "\n";
}

} // namespace penwick::test

// SPDX-License-Identifier: MIT
// Random sessions on the model and its history, held against the second model step by step.
#include "appearance/PenwickBundle.h"
#include "canvas/DrawingCanvasModel.h"
#include "history/UndoRedoManager.h"
#include "soak/PlainDrawing.h"
#include "support/NotificationRecorder.h"
#include "textbox/TextBoxDelegate.h"
#include "textbox/TnTextBox.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <QColor>
#include <QObject>

#include <map>
#include <memory>
#include <string>
#include <utility>
#include <vector>

namespace penwick::test {
namespace {

constexpr double lineDistance = 10.0;

class Owner final : public QObject, public TextBoxDelegate
{
public:
    void shouldDeleteTheTextBox(std::int64_t /*withHash*/) override { }
};

using Names = std::vector<std::string>;
using Records = std::vector<std::pair<std::string, std::string>>; // what was done, to what

Records recordsOf(const std::vector<PlainDrawing::Record> &stack)
{
    Records records;
    for (const PlainDrawing::Record &record : stack)
        records.emplace_back(record.action, record.name);
    return records;
}

/// The model and the second one, going through the same session.
class Session
{
public:
    Session()
    {
        // A text box makes its delete button, which needs its pictures.
        setPenwickBundle(std::make_shared<platform::Bundle>(QStringLiteral(":/penwick/images")));
        m_history->setDrawingCanvasModel(m_model);
        m_model->setUndoRedoManager(m_history);
        m_plain.setListener([this](const std::string &posted) { m_posted.push_back(posted); });
    }

    void doSomething()
    {
        switch (*rc::gen::weightedElement<int>(
            { { 12, 0 }, { 6, 1 }, { 6, 2 }, { 6, 3 }, { 3, 4 }, { 1, 5 }, { 3, 6 }, { 3, 7 } })) {
        case 0:
            beginStroke();
            break;
        case 1:
            extendStroke();
            break;
        case 2:
            erase();
            break;
        case 3:
            addTextBox();
            break;
        case 4:
            deleteTextBox();
            break;
        case 5:
            m_model->clearCanvas();
            m_plain.clear();
            break;
        case 6:
            undoSeveralTimes();
            break;
        default:
            redoSeveralTimes();
        }
    }

    /// Both sides hold the same, posted the same, and no older copy has changed.
    void compare()
    {
        RC_ASSERT(postedByProduct() == std::exchange(m_posted, {}));
        RC_ASSERT(namesOf(m_model->pathArray()) == m_plain.strokes());
        RC_ASSERT(namesOf(m_model->textBoxArray()) == m_plain.boxes());
        RC_ASSERT(recordsOf(m_history->undoStack()) == test::recordsOf(m_plain.undoStack()));
        RC_ASSERT(recordsOf(m_history->redoStack()) == test::recordsOf(m_plain.redoStack()));
        RC_ASSERT(m_history->undoCount() == m_plain.undoCount());
        for (const auto &[strokes, names] : m_copies)
            RC_ASSERT(namesOf(strokes) == names);
    }

    /// Takes a copy of the strokes, as the canvas view does, and keeps it.
    void keepCopy() { m_copies.emplace_back(m_model->pathArray(), m_plain.strokes()); }

private:
    [[nodiscard]] Names namesOf(const EntryList<StrokeEntry> &entries) const
    {
        Names names;
        for (const StrokeEntry &entry : entries)
            names.push_back(m_names.at(entry.pathId));
        return names;
    }

    [[nodiscard]] Names namesOf(const EntryList<TextBoxEntry> &entries) const
    {
        Names names;
        for (const TextBoxEntry &entry : entries)
            names.push_back(m_names.at(entry.textId));
        return names;
    }

    [[nodiscard]] Records recordsOf(const RecordStack &stack) const
    {
        static const std::map<ActionType, std::string> actions { { ActionType::draw, "draw" },
            { ActionType::erase, "erase" }, { ActionType::clear, "clear" } };
        Records records;
        for (const UndoRedoState &record : stack) {
            const auto *const stroke = std::get_if<StrokeEntry>(&record.element);
            const std::int64_t id
                = stroke ? stroke->pathId : std::get<TextBoxEntry>(record.element).textId;
            RC_ASSERT(id == record.elementId);
            records.emplace_back(actions.at(record.actionAssociated), m_names.at(id));
        }
        return records;
    }

    /// What the product posted, by name instead of identifier.
    [[nodiscard]] std::vector<std::string> postedByProduct()
    {
        const std::string removal = "removeWithId ";
        std::vector<std::string> posted = m_recorder.take();
        for (std::string &each : posted) {
            if (each.starts_with(removal))
                each = removal + m_names.at(std::stoll(each.substr(removal.size())));
        }
        return posted;
    }

    static double anyX() { return *rc::gen::inRange(0, 40); }
    static int anyLine() { return *rc::gen::inRange(0, 4); }

    void beginStroke()
    {
        const double y = anyLine() * lineDistance;
        const double x = anyX();
        m_model->createPathWithParam(Qt::black, 5.0, { x, y });
        m_plain.beginStroke({ x, y }, 5.0);
        m_names[m_model->pathArray().last().pathId] = m_plain.strokes().back();
        if (*rc::gen::inRange(0, 4) > 0)
            extendStroke();
    }

    // Along its line: no two strokes cross, and every distance is a whole number.
    void extendStroke()
    {
        const double x = anyX();
        const Names &strokes = m_plain.strokes();
        const double y = strokes.empty() ? 0.0 : m_plain.stroke(strokes.back()).next.y;
        m_model->updateTheCurrentPath({ x, y });
        m_plain.extendStroke({ x, y });
    }

    void erase()
    {
        const double y = anyLine() * lineDistance + *rc::gen::inRange(-3, 4);
        const double x = anyX();
        const bool isErased = m_model->performEraseOperationAtLocation({ x, y });
        RC_ASSERT(isErased == m_plain.eraseAt({ x, y }));
    }

    // More than five in a row now and then: that is where the button rules change.
    static int anyRepetition() { return *rc::gen::inRange(1, 9); }

    void undoSeveralTimes()
    {
        for (int left = anyRepetition(); left > 0; --left) {
            m_history->undoAction();
            m_plain.undo();
        }
    }

    void redoSeveralTimes()
    {
        for (int left = anyRepetition(); left > 0; --left) {
            m_history->redoAction();
            m_plain.redo();
        }
    }

    void addTextBox()
    {
        m_model->createTextBox({ anyX(), 0 }, Qt::black, 24.0, &m_owner);
        m_names[m_model->textBoxArray().last().textId] = m_plain.addBox();
    }

    void deleteTextBox()
    {
        const EntryList<TextBoxEntry> &boxes = m_model->textBoxArray();
        const int index = boxes.isEmpty() ? -1 : *rc::gen::inRange(0, boxes.size());
        const std::int64_t id = index < 0 ? -1 : boxes[index].textId;
        const std::string name = index < 0 ? "none" : m_names.at(id);
        m_model->deleteTextBoxWith(id);
        m_plain.deleteBox(name);
    }

    Owner m_owner;
    std::shared_ptr<DrawingCanvasModel> m_model = std::make_shared<DrawingCanvasModel>();
    std::shared_ptr<UndoRedoManager> m_history = std::make_shared<UndoRedoManager>();
    PlainDrawing m_plain;
    std::map<std::int64_t, std::string> m_names; // of strokes and boxes, as the second model calls
    NotificationRecorder m_recorder;
    std::vector<std::string> m_posted; // by the second model
    std::vector<std::pair<EntryList<StrokeEntry>, Names>> m_copies;
};

RC_GTEST_PROP(HistoryProperties, everySessionGoesAsTheSecondModelSays, ())
{
    Session session;
    const int steps = *rc::gen::inRange(0, 600);
    for (int step = 0; step < steps; ++step) {
        session.doSomething();
        session.compare();
        if (step % 10 == 0)
            session.keepCopy();
    }
}

} // namespace
} // namespace penwick::test

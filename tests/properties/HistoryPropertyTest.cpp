// SPDX-License-Identifier: MIT
// Random sessions on the model and its history, held against the reference step by step.
#include "appearance/PenwickBundle.h"
#include "canvas/DrawingCanvasModel.h"
#include "history/UndoRedoManager.h"
#include "properties/ReferenceCanvas.h"
#include "support/NotificationRecorder.h"
#include "textbox/TextBoxDelegate.h"
#include "textbox/TnTextBox.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <QColor>
#include <QObject>

#include <memory>
#include <tuple>
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

/// What either side holds, in one comparable form: action, is it a stroke, identifier.
using Records = std::vector<std::tuple<int, bool, std::int64_t>>;

Records recordsOf(const RecordStack &stack)
{
    Records records;
    for (const UndoRedoState &record : stack) {
        records.emplace_back(static_cast<int>(record.actionAssociated),
            std::holds_alternative<StrokeEntry>(record.element), record.elementId);
    }
    return records;
}

Records recordsOf(const std::vector<ReferenceCanvas::Record> &stack)
{
    Records records;
    for (const ReferenceCanvas::Record &record : stack)
        records.emplace_back(static_cast<int>(record.action), record.item.isStroke, record.item.id);
    return records;
}

/// The model and the reference, going through the same session.
class Session
{
public:
    Session()
    {
        // A text box makes its delete button, which needs its pictures.
        setPenwickBundle(std::make_shared<platform::Bundle>(QStringLiteral(":/penwick/images")));
        m_history->setDrawingCanvasModel(m_model);
        m_model->setUndoRedoManager(m_history);
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
            m_reference.clear();
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
        RC_ASSERT(m_recorder.take() == std::exchange(m_reference.posted, {}));
        RC_ASSERT(strokeIds(m_model->pathArray()) == m_reference.strokeIds());
        RC_ASSERT(textBoxIds(m_model->textBoxArray()) == m_reference.textBoxIds());
        RC_ASSERT(recordsOf(m_history->undoStack()) == recordsOf(m_reference.undoStack));
        RC_ASSERT(recordsOf(m_history->redoStack()) == recordsOf(m_reference.redoStack));
        RC_ASSERT(m_history->undoCount() == m_reference.undoCount);
        for (const auto &[strokes, ids] : m_copies)
            RC_ASSERT(strokeIds(strokes) == ids);
    }

    /// Takes a copy of the strokes, as the canvas view does, and keeps it.
    void keepCopy() { m_copies.emplace_back(m_model->pathArray(), m_reference.strokeIds()); }

private:
    static ReferenceCanvas::Ids strokeIds(const EntryList<StrokeEntry> &entries)
    {
        ReferenceCanvas::Ids ids;
        for (const StrokeEntry &entry : entries)
            ids.push_back(entry.pathId);
        return ids;
    }

    static ReferenceCanvas::Ids textBoxIds(const EntryList<TextBoxEntry> &entries)
    {
        ReferenceCanvas::Ids ids;
        for (const TextBoxEntry &entry : entries)
            ids.push_back(entry.textId);
        return ids;
    }

    static double anyX() { return *rc::gen::inRange(0, 40); }
    static int anyLine() { return *rc::gen::inRange(0, 4); }

    void beginStroke()
    {
        const int line = anyLine();
        const double x = anyX();
        m_model->createPathWithParam(Qt::black, 5.0, { x, line * lineDistance });
        m_reference.beginStroke(m_model->pathArray().last().pathId, line, x);
        if (*rc::gen::inRange(0, 4) > 0)
            extendStroke();
    }

    void extendStroke()
    {
        const double x = anyX();
        const int line = m_reference.strokes.empty() ? 0 : m_reference.newestLine();
        m_model->updateTheCurrentPath({ x, line * lineDistance });
        m_reference.extendStroke(x);
    }

    void erase()
    {
        const int line = anyLine();
        const double x = anyX();
        const double above = *rc::gen::inRange(-3, 4);
        const bool isErased
            = m_model->performEraseOperationAtLocation({ x, line * lineDistance + above });
        RC_ASSERT(isErased == m_reference.eraseAt(line, x, above));
    }

    // More than five in a row now and then: that is where the button rules change.
    static int anyRepetition() { return *rc::gen::inRange(1, 9); }

    void undoSeveralTimes()
    {
        for (int left = anyRepetition(); left > 0; --left) {
            m_history->undoAction();
            m_reference.undo();
        }
    }

    void redoSeveralTimes()
    {
        for (int left = anyRepetition(); left > 0; --left) {
            m_history->redoAction();
            m_reference.redo();
        }
    }

    void addTextBox()
    {
        m_model->createTextBox({ anyX(), 0 }, Qt::black, 24.0, &m_owner);
        m_reference.addTextBox(m_model->textBoxArray().last().textId);
    }

    void deleteTextBox()
    {
        const auto ids = m_reference.textBoxIds();
        const std::int64_t id = ids.empty() ? -1 : *rc::gen::elementOf(ids);
        m_model->deleteTextBoxWith(id);
        m_reference.deleteTextBox(id);
    }

    Owner m_owner;
    std::shared_ptr<DrawingCanvasModel> m_model = std::make_shared<DrawingCanvasModel>();
    std::shared_ptr<UndoRedoManager> m_history = std::make_shared<UndoRedoManager>();
    ReferenceCanvas m_reference;
    NotificationRecorder m_recorder;
    std::vector<std::pair<EntryList<StrokeEntry>, ReferenceCanvas::Ids>> m_copies;
};

RC_GTEST_PROP(HistoryProperties, everySessionEndsAsTheReferenceDoes, ())
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

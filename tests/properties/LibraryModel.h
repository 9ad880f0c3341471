#pragma once

#include "document/TText.h"

#include <QList>
#include <QMap>
#include <QPointF>
#include <QSet>
#include <QString>
#include <QStringList>
#include <algorithm>
#include <cmath>
#include <optional>

// A plain model of a title folder with its undo stack: the expected state of list, files, selection and edit
// context after each step. It uses no widgets, no files and no undo framework; records are kept by value.
class LibraryModel
{
public:
    static constexpr int UNDO_LIMIT = 25;

    // Text objects by id.
    using Texts = QMap<int, TText>;

    struct Title {
        Texts saved;          // the contents of its file
        bool settled = false; // whether its pictures were made from its texts since the folder was opened
    };

    struct Command {
        enum Kind { PASTE, DELETE, MOVE, FOCUS, CREATE_TEXT, DELETE_TEXT, EDIT_TEXT, MOVE_TEXT };
        Kind kind;
        QString title;                    // the title that the command changes
        QString other = {};               // FOCUS: the title selected before
        int position = -1;                // PASTE: the row before it; DELETE: its row; MOVE: the old row
        int selected = -1;                // PASTE: the row selected before; MOVE: the new row
        bool wasSelected = false;         // DELETE
        bool isNew = false;               // DELETE: whether it was created during the request
        int id = 0;                       // of the text object
        std::optional<TText> before = {}; // CREATE_TEXT: the object removed by undo
        std::optional<TText> after = {};
        QPointF from = {};
        QPointF to = {};
    };

    QStringList order;
    QMap<QString, Title> titles; // all titles so far, listed or not
    QSet<QString> context;       // titles created during the request
    QString selected;
    QString canvas;
    Texts live; // objects on the canvas
    bool pictureNeeded = false;

    // Opens the folder with these titles.
    void open(const QStringList& stems)
    {
        order = stems;
        context.clear();
        clearStack();
        selected.clear();
        canvas.clear();
        live.clear();
        pictureNeeded = false;
        for (Title& title : titles)
            title.settled = false;
        if (!order.isEmpty())
            select(0);
    }

    bool canUndo() const { return m_index > 0; }
    bool canRedo() const { return m_index < m_commands.size(); }

    void clearStack()
    {
        m_commands.clear();
        m_index = 0;
        m_clean = 0;
    }

    // Returns the titles that are listed or can be restored by undo or redo.
    QSet<QString> reachable() const
    {
        QSet<QString> stems(order.begin(), order.end());
        for (const Command& command : m_commands)
            stems << command.title << command.other;
        stems.remove(QString());
        return stems;
    }

    // Returns the commands on the stack, with a bar before the next one to be redone.
    QString stack() const
    {
        static const char* const NAMES[] = {"paste",       "delete",      "move",      "focus",
                                            "create text", "delete text", "edit text", "move text"};
        QStringList told;
        for (const Command& command : m_commands)
            told << QStringLiteral("%1 %2 %3").arg(NAMES[command.kind], command.title).arg(command.id);
        told.insert(m_index, QStringLiteral("|"));
        return told.join(QStringLiteral(", "));
    }

    // Actions of the operator. A pasted title brings its texts with it.
    void paste(const QString& stem, const Texts& texts, int behind)
    {
        titles[stem].saved = texts;
        Command command{Command::PASTE, stem};
        command.position = std::clamp(behind, -1, int(order.size()) - 1);
        command.selected = int(order.indexOf(selected));
        pasteAgain(command);
        push(command);
        pictureNeeded = true;
    }

    void remove(const QString& stem)
    {
        Command command{Command::DELETE, stem};
        command.position = int(order.indexOf(stem));
        command.wasSelected = stem == selected;
        removeAgain(command);
        push(command);
    }

    void move(int from, int to)
    {
        if (from == to)
            return;
        order.move(from, to);
        Command command{Command::MOVE, order.at(to)};
        command.position = from;
        command.selected = to;
        push(command);
    }

    void focus(const QString& stem)
    {
        if (stem == selected)
            return;
        Command command{Command::FOCUS, stem, selected};
        changeFocus(stem);
        if (m_index == m_clean)
            return; // selecting a title is not an undo step while the stack is clean
        if (m_index > 0 && m_commands[m_index - 1].kind == Command::FOCUS) {
            dropRedo();
            m_commands[m_index - 1].title = stem;
            return;
        }
        push(command);
    }

    void createText(const TText& made)
    {
        live[made.getTextObjectID()] = made;
        Command command{Command::CREATE_TEXT, canvas};
        command.id = made.getTextObjectID();
        push(command);
        save();
    }

    void editText(const TText& before, const TText& after)
    {
        live[after.getTextObjectID()] = after;
        Command command{Command::EDIT_TEXT, canvas};
        command.id = after.getTextObjectID();
        command.before = before;
        command.after = after;
        push(command);
        save();
    }

    void deleteText(int id)
    {
        Command command{Command::DELETE_TEXT, canvas};
        command.id = id;
        command.before = live.take(id);
        push(command);
        save();
    }

    void moveText(int id, QPointF to)
    {
        Command command{Command::MOVE_TEXT, canvas};
        command.id = id;
        command.from = placeOf(live[id]);
        command.to = to;
        place(id, to);
        push(command);
        save();
    }

    void undo()
    {
        if (canUndo())
            perform(m_commands[--m_index], false);
    }

    void redo()
    {
        if (canRedo())
            perform(m_commands[m_index++], true);
    }

    // Makes the pictures of the title shown, as the canvas does.
    void leave()
    {
        if (pictureNeeded && !canvas.isEmpty())
            titles[canvas].settled = true;
        pictureNeeded = false;
    }

    // Returns whether the pictures on the disk must match the saved texts after all pictures are written.
    bool hasCurrentPictures(const QString& stem) const
    {
        return titles.value(stem).settled && !(stem == canvas && pictureNeeded);
    }

    static QPointF placeOf(const TText& text) { return {text.getXValue(), text.getYValue()}; }

    static bool isSame(const TText& a, const TText& b)
    {
        constexpr float ROUNDED = 0.01F; // files store positions with few digits
        return a.getTextObjectID() == b.getTextObjectID() && a.getText() == b.getText() &&
               std::abs(a.getXValue() - b.getXValue()) < ROUNDED &&
               std::abs(a.getYValue() - b.getYValue()) < ROUNDED && a.getZValue() == b.getZValue() &&
               a.getTextAlign() == b.getTextAlign() && a.shadowIsTheSame(b) && a.textItemsIsTheSame(b);
    }

    static bool isSame(const Texts& a, const Texts& b)
    {
        return std::equal(a.begin(), a.end(), b.begin(), b.end(),
                          [](const TText& x, const TText& y) { return isSame(x, y); });
    }

private:
    void select(int index)
    {
        const QString stem = order.value(index);
        if (stem != selected && !selected.isEmpty())
            leave();
        selected = stem;
        show(stem);
    }

    void changeFocus(const QString& stem)
    {
        if (stem.isEmpty() || stem == selected)
            return;
        leave();
        selected = stem;
        show(stem);
    }

    void show(const QString& stem)
    {
        canvas = stem;
        live = titles.value(stem).saved;
    }

    // Saves the texts that are not blank.
    void save()
    {
        pictureNeeded = true;
        if (canvas.isEmpty())
            return;
        Texts& saved = titles[canvas].saved;
        saved = live;
        saved.removeIf([](const auto& entry) {
            return QString::fromStdString(entry.value().getText()).simplified().isEmpty();
        });
    }

    void place(int id, QPointF to)
    {
        if (!live.contains(id))
            return;
        live[id].setXValue(float(to.x()));
        live[id].setYValue(float(to.y()));
    }

    void dropRedo()
    {
        m_commands.resize(m_index);
        if (m_clean > m_index)
            m_clean = -1;
    }

    void push(const Command& command)
    {
        dropRedo();
        m_commands.append(command);
        ++m_index;
        if (m_commands.size() > UNDO_LIMIT) {
            m_commands.removeFirst();
            --m_index;
            m_clean = std::max<qsizetype>(m_clean - 1, -1);
        }
    }

    void pasteAgain(const Command& command)
    {
        order.insert(std::min<qsizetype>(command.position + 1, order.size()), command.title);
        context << command.title;
        select(command.position + 1);
    }

    void removeAgain(Command& command)
    {
        order.removeAll(command.title);
        command.isNew = context.remove(command.title) || command.isNew;
        command.wasSelected = command.wasSelected || selected == command.title;
        if (command.wasSelected)
            select(std::min<int>(command.position, int(order.size()) - 1));
    }

    void perform(Command& command, bool isRedo)
    {
        switch (command.kind) {
        case Command::PASTE:
            if (isRedo) {
                pasteAgain(command);
            } else {
                order.removeAll(command.title);
                context.remove(command.title);
                select(command.selected);
            }
            return;
        case Command::DELETE:
            if (isRedo) {
                removeAgain(command);
            } else {
                order.insert(command.position, command.title);
                if (command.wasSelected)
                    select(command.position);
                if (command.isNew)
                    context << command.title;
            }
            return;
        case Command::MOVE:
            order.removeAll(command.title);
            order.insert(isRedo ? command.selected : command.position, command.title);
            return;
        case Command::FOCUS:
            changeFocus(isRedo ? command.title : command.other);
            return;
        default:
            // Another title may be shown, since selecting one is not always an undo step.
            if (command.title == canvas)
                performOnText(command, isRedo);
            save();
        }
    }

    void performOnText(Command& command, bool isRedo)
    {
        switch (command.kind) {
        case Command::CREATE_TEXT:
            if (!isRedo && live.contains(command.id)) {
                command.before = live.take(command.id);
            } else if (isRedo && command.before) {
                live[command.id] = *command.before;
                command.before.reset();
            }
            break;
        case Command::DELETE_TEXT:
            if (isRedo)
                live.remove(command.id);
            else
                live[command.id] = *command.before;
            break;
        case Command::EDIT_TEXT:
            if (live.contains(command.id))
                live[command.id] = isRedo ? *command.after : *command.before;
            break;
        case Command::MOVE_TEXT:
            place(command.id, isRedo ? command.to : command.from);
            break;
        default:
            break;
        }
    }

    QList<Command> m_commands;
    qsizetype m_index = 0; // index of the next command to redo
    qsizetype m_clean = 0; // -1 when the clean state was dropped
};

#pragma once

class SiblingLinks;

// What could not be saved by the end of a session, and the question to the operator whether it may be lost.
// GUI thread.
class UnsavedWork
{
public:
    // Tries once more to save what the disk has refused. Asks the operator whether the rest may be lost and
    // returns true when there is any and the question can be shown.
    bool ask(SiblingLinks& links);
    // Returns whether the operator has been asked, and forgets that.
    bool takeQuestion();

    // Tries once more to save, then gives up what the disk still refuses. The log names each file.
    static void giveUp();
    // Logs the files that have been saved but may not have reached the disk yet; the first of many.
    static void logUnsynced();

private:
    enum class Question { None, LoseUnsavedWork };

    Question m_question = Question::None;
};

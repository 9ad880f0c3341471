#pragma once

class SiblingLinks;

// The work that could not be saved by the end of a session, and the question to the operator whether it may
// be lost. GUI thread.
class UnsavedWork
{
public:
    // Retries the refused writes. If some are left, asks the operator whether they may be lost; returns
    // whether the question is shown.
    bool ask(SiblingLinks& links);
    // Returns whether the operator was asked, and resets that.
    bool takeQuestion();

    // Retries the refused writes, then drops those that fail again and logs each file.
    static void giveUp();
    // Logs the files that are saved but may not be synced to the disk yet; of many only the first.
    static void logUnsynced();

private:
    enum class Question { None, LoseUnsavedWork };

    Question m_question = Question::None;
};

#pragma once

// How the current session ends: whether the window is hidden or the process ends with it, and whether the
// process that asked for the window has to be asked first. One state instead of several flags. GUI thread.
class SessionEnd
{
public:
    enum class Way {
        Quit,        // closing the window ends the process; used until main() has finished the start
        AskThenQuit, // like Quit, in a session that another process asked for
        Hide,
        AskThenHide,
        EndProcess // the process is ending, and no session follows
    };

    Way way() const { return m_way; }

    // Sets whether closing the window ends the process. Does not change whether to ask first.
    void setQuits(bool quits);
    // Called when a session begins. isAskedFor: another process waits for the titles made in it.
    void beginSession(bool isAskedFor);
    // Marks that the end of the process has begun. Returns false if it had begun before.
    bool beginEndOfProcess();

    // Returns whether the window is to be closed instead of hidden.
    bool closesWindow() const;
    // Returns whether the process that asked for the session may have to answer first.
    bool asksFirst() const;

private:
    Way m_way = Way::Quit;
};

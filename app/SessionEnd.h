#pragma once

// How the session at hand ends: whether the window is hidden or the process ends with it, and whether the
// process that asked for the window has to be asked first. One state instead of several flags. GUI thread.
class SessionEnd
{
public:
    enum class Way {
        Quit,        // closing the window ends the process, as before main() has finished the start
        AskThenQuit, // the same, for a session that another process asked for
        Hide,
        AskThenHide,
        EndProcess // the process is being ended, and no session follows
    };

    Way way() const { return m_way; }

    // Sets whether closing the window ends the process. Keeps whether to ask.
    void setQuits(bool quits);
    // A session begins; isAskedFor: another process waits for what is made in it.
    void beginSession(bool isAskedFor);
    // Returns false when the end of the process has begun before.
    bool beginEndOfProcess();

    // Returns whether the window is to be closed and not only hidden.
    bool closesWindow() const;
    // Returns whether the process that asked for the session may have to answer first.
    bool asksFirst() const;

private:
    Way m_way = Way::Quit;
};

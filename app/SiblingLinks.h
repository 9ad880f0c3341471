#pragma once

#include <QString>
#include <QWindow>
#include <memory>

#include "messaging/services/APPEventDefine.h"
#include "messaging/services/MessageDefine.h"

class KSInputContext;
class QWidget;
class TitlerToolFactory;

// The window's links to the sibling processes: the factory that makes them, the controllers of the services,
// and the input context with the soft keyboard. The controllers are singletons that exist as long as this
// object. Without a link calls do nothing. GUI thread only.
class SiblingLinks
{
public:
    // Makes the message service available to the other folders; it is created on first use.
    SiblingLinks();
    // Deletes the controllers, then closes the connections. Takes 5 seconds when the power service is
    // connected.
    ~SiblingLinks();
    SiblingLinks(const SiblingLinks&) = delete;
    SiblingLinks& operator=(const SiblingLinks&) = delete;

    // Makes the factory and starts listening for requests.
    void initProcessFactory();
    // Begins the hand-shakes with the services. Blocks until both siblings listen.
    void initProcessCommunications(WId window);
    // Returns whether the controllers exist.
    bool areMade() const { return m_areMade; }

    // Sends the message. Returns false when the controllers do not exist.
    bool postMessage(MessageDef::Message_ID id);
    bool postMessage(MessageDef::Message_ID id, const QString& text);
    // Reports which program has the topmost window.
    void changeTopWindow(MessageDefine::_emTopWindow top);
    // Sets the window that has to be visible for requests for masks.
    void setMessageMainWindow(QWidget* window);

    // Report that editing of the folder has begun or ended. Full paths; an empty one is ignored.
    void editFolderStarts(const QString& folder);
    void editFolderEnds(const QString& folder);
    // Delivers the reports on titles that other threads have queued, so that the siblings receive them before
    // later messages.
    void sendTitleReports();

    void sendAPPEvent(APPEventDefine::LOCKTYPE type, bool on);
    // Requests that the input language be reported again.
    void getInputLanguage();

    // Returns the input context; null when the platform uses another one than this program's.
    KSInputContext* inputContext() const { return m_inputContext; }
    // Close the keyboard without the usual closing sequence: the first at the end of a session, the second
    // during one.
    void simpleCloseSoftKeyboard();
    void dummyCloseSoftKeyboard();

private:
    void linkSoftKeyboard(WId window);

    std::unique_ptr<TitlerToolFactory> m_factory;
    KSInputContext* m_inputContext = nullptr; // owned by the platform integration
    bool m_areMade = false;
};

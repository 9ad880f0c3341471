#pragma once

#include <QString>
#include <QWindow>
#include <memory>

#include "messaging/services/APPEventDefine.h"
#include "messaging/services/MessageDefine.h"

class KSInputContext;
class QWidget;
class TitlerToolFactory;

// The links of the window to the sibling processes: the factory that makes them, the controllers of the
// services, and the input context with its soft keyboard. The controllers are singletons that live as long as
// this object. Without a link every call does nothing. GUI thread only.
class SiblingLinks
{
public:
    // Offers the message service to the folders below, from its first use on.
    SiblingLinks();
    // Ends the controllers, then the connections. Takes 5 seconds when the power service is connected.
    ~SiblingLinks();
    SiblingLinks(const SiblingLinks&) = delete;
    SiblingLinks& operator=(const SiblingLinks&) = delete;

    // Makes the factory and begins to listen for requests.
    void initProcessFactory();
    // Makes the hand-shakes with the services. Blocks until both siblings listen.
    void initProcessCommunications(WId window);
    // Returns whether there are controllers.
    bool areMade() const { return m_areMade; }

    // Returns whether the message has been sent.
    bool postMessage(MessageDef::Message_ID id);
    bool postMessage(MessageDef::Message_ID id, const QString& text);
    // Says which program has the topmost window.
    void changeTopWindow(MessageDefine::_emTopWindow top);
    // Gives the window that is to show while siblings ask for masks.
    void setMessageMainWindow(QWidget* window);

    // The folder is being edited here, and is free again; full paths, and an empty one is ignored.
    void editFolderStarts(const QString& folder);
    void editFolderEnds(const QString& folder);
    // Delivers what other threads have reported of titles, so that siblings hear of it before what follows.
    void sendTitleReports();

    void sendAPPEvent(APPEventDefine::LOCKTYPE type, bool on);
    // Has the input language reported again.
    void getInputLanguage();

    // Null without the program's own input context.
    KSInputContext* inputContext() const { return m_inputContext; }
    // Closes it without its closing ceremony: at the end of a session, and in the middle of one.
    void simpleCloseSoftKeyboard();
    void dummyCloseSoftKeyboard();

private:
    void linkSoftKeyboard(WId window);

    std::unique_ptr<TitlerToolFactory> m_factory;
    KSInputContext* m_inputContext = nullptr; // owned by the platform integration
    bool m_areMade = false;
};

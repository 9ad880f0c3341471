#include "app/SessionEnd.h"

void SessionEnd::setQuits(bool quits)
{
    if (m_way == Way::EndProcess)
        return;
    if (asksFirst())
        m_way = quits ? Way::AskThenQuit : Way::AskThenHide;
    else
        m_way = quits ? Way::Quit : Way::Hide;
}

void SessionEnd::beginSession(bool isAskedFor)
{
    if (m_way == Way::EndProcess)
        return;
    if (closesWindow())
        m_way = isAskedFor ? Way::AskThenQuit : Way::Quit;
    else
        m_way = isAskedFor ? Way::AskThenHide : Way::Hide;
}

bool SessionEnd::beginEndOfProcess()
{
    if (m_way == Way::EndProcess)
        return false;
    m_way = Way::EndProcess;
    return true;
}

bool SessionEnd::closesWindow() const
{
    return m_way != Way::Hide && m_way != Way::AskThenHide;
}

bool SessionEnd::asksFirst() const
{
    return m_way == Way::AskThenQuit || m_way == Way::AskThenHide;
}

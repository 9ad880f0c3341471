#include "app/UnsavedWork.h"

#include "app/LossDescription.h"
#include "app/SiblingLinks.h"
#include "canvas/SaveOutage.h"
#include "support/FileSyncQueue.h"
#include "support/LogManager.h"
#include "support/RefusedWrites.h"

#include <QString>
#include <algorithm>
#include <string>
#include <utility>
#include <vector>

namespace
{

constexpr std::size_t MOST_LOGGED = 20;
constexpr int LOG_NUMBER = 400;

void logPath(const char* what, const std::string& path)
{
    LOG_DEBUG_OPERATE(L"TitlerWindow", LOG_NUMBER,
                      (QString::fromLatin1(what) + QString::fromStdString(path)).toStdWString());
}

} // namespace

bool UnsavedWork::ask(SiblingLinks& links)
{
    m_question = Question::None;
    for (const RefusedWrites::File& file : RefusedWrites::forgetVanished())
        logPath("gone with its folder: ", file.path);
    if (SaveOutage::instance()->retry() ||
        !links.postMessage(MessageDef::MESSAGE_CONFIRM_CLOSE, LossDescription::of(RefusedWrites::files())))
        return false;
    m_question = Question::LoseUnsavedWork;
    return true;
}

bool UnsavedWork::takeQuestion()
{
    return std::exchange(m_question, Question::None) == Question::LoseUnsavedWork;
}

void UnsavedWork::giveUp()
{
    if (SaveOutage::instance()->retry())
        return;
    for (const RefusedWrites::File& file : RefusedWrites::files()) {
        logPath("lost, not saved: ", file.path);
        RefusedWrites::forget(file.path);
    }
    SaveOutage::instance()->retry(); // ends the outage
}

void UnsavedWork::logUnsynced()
{
    const std::vector<std::string> paths = FileSyncQueue::unsynced();
    for (std::size_t i = 0; i < std::min(paths.size(), MOST_LOGGED); ++i)
        logPath("not yet on the disk: ", paths[i]);
    if (paths.size() > MOST_LOGGED)
        logPath("not yet on the disk, more files: ", std::to_string(paths.size() - MOST_LOGGED));
}

// Plays an operator's session on a data path, for the tests that fail its file operations or kill it in the
// middle.
//
//   titler_fault_session make DATA         fills an empty data path
//   titler_fault_session pictures DATA     edits each title once, so that all have their pictures
//   titler_fault_session play DATA         plays the session, looks at everything once more, and ends
//   titler_fault_session play-healed DATA  the same with a disk that is well again before each Close
//   titler_fault_session look DATA         what the next process finds
//   titler_fault_session soak DATA COUNT   opens, edits and closes so many times, reporting the memory in use
#include "FaultShim.h"
#include "OperatorSession.h"
#include "support/FileSyncQueue.h"
#include "support/LeftoverSweep.h"
#include "tests/library/TemplateFixture.h"
#include "touchui/KSInputContext.h"

#include <QApplication>
#include <QLoggingCategory>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <memory>

namespace
{

constexpr std::chrono::seconds SYNC_DEADLINE(10);

// Titles, templates and settings as the fixtures of the library make them, moved to data.
void makeData(const QString& data)
{
    const TemplateFixture fixture;
    const QString folder = fixture.titleRoot() + '/' + OperatorSession::FOLDER;
    TemplateFixture& files = const_cast<TemplateFixture&>(fixture);
    files.resetTemplates();
    files.makePresets("templates_en", {OperatorSession::PRESET_TEXT});
    files.makePresets("templates_chs", {OperatorSession::PRESET_TEXT});
    files.makeUserTemplate("UserTemplate_001", {OperatorSession::USER_TEXT});
    files.makeFolder(OperatorSession::FOLDER);
    LibraryFixture::fillFolder(folder, OperatorSession::STEMS);
    LibraryFixture::writeOrder(files.userRoot(), {"UserTemplate_001/Titler"});
    FileSyncQueue::flush(SYNC_DEADLINE);
    std::filesystem::copy(QFileInfo(fixture.titleRoot()).path().toStdString(),
                          (data + "/defaultuser").toStdString(), std::filesystem::copy_options::recursive);
}

} // namespace

int main(int argc, char** argv)
{
    if (argc < 3) {
        std::fprintf(stderr, "usage: %s make|pictures|play|play-healed|look|soak DATA [COUNT]\n", argv[0]);
        return 2;
    }
    const QString command = QString::fromLocal8Bit(argv[1]);
    const QString data = QString::fromLocal8Bit(argv[2]);
    KSInputContext::install();
    QApplication application(argc, argv);
    application.setObjectName(QStringLiteral("Titler"));
    QApplication::setQuitOnLastWindowClosed(false);
    QLoggingCategory::setFilterRules(QStringLiteral("*.debug=false"));
    if (command == QLatin1String("make")) {
        makeData(data);
        return 0;
    }
    qputenv("K2SYS_AC_ROOT", "");
    qputenv("K2SYS_AC_DATA", data.toLocal8Bit());
    LeftoverSweep::sweepProgramFolders();
    int result = 0;
    {
        OperatorSession session(data + QStringLiteral("/defaultuser/titles"));
        if (!session.isReady()) {
            std::fprintf(stderr, "no free ports\n");
            return 2;
        }
        if (command == QLatin1String("pictures"))
            session.makePictures();
        else if (command.startsWith(QLatin1String("play")))
            session.play(command == QLatin1String("play-healed"));
        else if (command == QLatin1String("soak"))
            session.soak(argc > 3 ? std::atoi(argv[3]) : 100);
        if (command != QLatin1String("pictures"))
            session.look();
        session.end();
    }
    FileSyncQueue::flush(SYNC_DEADLINE);
    return result;
}

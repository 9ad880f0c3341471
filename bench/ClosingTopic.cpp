// From Close to the answer, with one changed title of four texts. Compared with drawing its pictures by Qt
// alone and saving them with Qt's defaults.
#include "bench/BenchTitles.h"
#include "bench/PairList.h"
#include "bench/PeerProcess.h"
#include "bench/PlainTitle.h"
#include "bench/Topics.h"

#include <QByteArray>
#include <QElapsedTimer>
#include <QImage>
#include <QTemporaryDir>

namespace
{

constexpr double LIMIT = 25; // milliseconds
constexpr double NANOSECONDS = 1e9;
constexpr int CHARACTERS = 24;
constexpr int CHARACTER_SIZE = 96;
constexpr QSize AIR(1920, 1080);

void closeTitle(benchmark::State& state)
{
    PeerProcess window;
    if (!window.startRole(QStringLiteral("--closing-window"))) {
        state.SkipWithError("the window is not built");
        return;
    }
    for ([[maybe_unused]] auto _ : state) {
        const qlonglong time = window.ask("close\n").toLongLong();
        if (time <= 0) {
            state.SkipWithError("the window does not close");
            break;
        }
        state.SetIterationTime(static_cast<double>(time) / NANOSECONDS);
    }
}

void saveByQt(benchmark::State& state)
{
    const PlainTitle title(BenchTitles::title("/floor.xml", CHARACTERS, CHARACTER_SIZE), 1);
    const QTemporaryDir folder;
    for ([[maybe_unused]] auto _ : state) {
        QElapsedTimer timer;
        timer.start();
        const QImage big = title.draw(AIR, {});
        int number = 0;
        for (const QImage& picture : QList<QImage>{big} + PlainTitle::reduced(big))
            if (!picture.save(folder.filePath(QStringLiteral("%1.png").arg(++number))))
                state.SkipWithError("a picture cannot be saved");
        state.SetIterationTime(static_cast<double>(timer.nsecsElapsed()) / NANOSECONDS);
    }
}

} // namespace

void Topics::addClosing(PairList& list)
{
    list.add({"close_to_answer", 0, PairList::Clock::Step, LIMIT}, benchmark::kMillisecond, closeTitle,
             saveByQt);
}

// The four picture files of a title, compared with encoding the same pictures as fast as the libraries
// available can.
#include "bench/BareFiles.h"
#include "bench/BenchEnvironment.h"
#include "bench/BenchTitles.h"
#include "bench/FastPng.h"
#include "bench/PairList.h"
#include "bench/Topics.h"
#include "document/ImageResizer.h"
#include "document/PngWriter.h"
#include "library/PictureThread.h"
#include "library/ThumbnailRender.h"

#include <QPainter>
#include <QThread>
#include <array>
#include <memory>
#include <string>
#include <vector>

namespace
{

constexpr double AIM = 1.2;
constexpr double TRANSPARENT_AIM = 0.4;
constexpr double PHOTOGRAPH_AIM = 0.9;
constexpr unsigned long POLL = 50; // microseconds
constexpr std::array SUFFIXES = {"_1920.png", "_960.png", "_240S.png", "_240.png"};

// The input of the picture thread.
struct Job {
    Archive archive;
    QList<QImage> images; // big, middle

    QString path(const char* suffix) const
    {
        return QString::fromStdString(archive.getPath()).chopped(4) + QLatin1String(suffix);
    }
};

Job makeJob(const std::string& path, const QImage& background)
{
    Job job{BenchTitles::title(path, 40, 60), {}};
    QImage big(ThumbnailRender::THUMBNAIL_BIG_SIZE, QImage::Format_ARGB32_Premultiplied);
    big.fill(Qt::transparent);
    QPainter painter(&big);
    painter.setRenderHint(QPainter::Antialiasing);
    if (!background.isNull())
        painter.drawImage(0, 0, background);
    QFont font(QStringLiteral("KST"));
    font.setPixelSize(60);
    painter.setFont(font);
    painter.setPen(Qt::white);
    for (int line = 1; line <= BenchTitles::TEXTS; ++line)
        painter.drawText(60, 250 * line, QStringLiteral("Breaking news from the coast, live at ten"));
    painter.end();
    job.images = {big, big.scaled(ThumbnailRender::THUMBNAIL_MIDDLE_SIZE, Qt::IgnoreAspectRatio,
                                  Qt::SmoothTransformation)};
    return job;
}

void runThread(PictureThread& thread, const Job& job)
{
    thread.addArchive(&job.archive, job.images);
    while (!thread.isThreadWaiting())
        QThread::usleep(POLL);
}

// Returns whether the files contain the same pixels as files made with QImage::save() and ImageResizer.
bool filesAreRight(const Job& job)
{
    const QString middle = job.path("_check.png");
    const std::wstring black = job.path("_checkS.png").toStdWString();
    const std::wstring small = job.path("_checkC.png").toStdWString();
    std::wstring source = middle.toStdWString();
    job.images.at(1).save(middle);
    std::wstring blackPath = black;
    std::wstring smallPath = small;
    const QSize size = PictureThread::THUMBNAIL_SMALL_SIZE;
    if (!ImageResizer().resizeImageToThumbnail(source, blackPath, smallPath,
                                               static_cast<unsigned>(size.width()),
                                               static_cast<unsigned>(size.height())))
        return false;
    const QString big = job.path("_checkB.png");
    job.images.at(0).save(big);
    const std::array expected = {big, middle, QString::fromStdWString(black), QString::fromStdWString(small)};
    for (std::size_t i = 0; i < SUFFIXES.size(); ++i) {
        const QImage read(job.path(SUFFIXES[i]));
        if (read.isNull() || read != QImage(expected[i]))
            return false;
    }
    return true;
}

void savePictures(benchmark::State& state, const Job& job)
{
    PictureThread thread;
    runThread(thread, job);
    if (!filesAreRight(job)) {
        state.SkipWithError("the pixels of the files are not those of the pictures");
        return;
    }
    for ([[maybe_unused]] auto _ : state)
        runThread(thread, job);
}

using Encoders = std::vector<std::unique_ptr<FastPng>>;

// Prepares the fastest encoder for each picture, once.
void prepare(Encoders& encoders, const Job& job)
{
    if (!encoders.empty())
        return;
    PictureThread thread;
    runThread(thread, job);
    for (std::size_t i = 0; i < SUFFIXES.size(); ++i) {
        const bool isDrawn = i < static_cast<std::size_t>(job.images.size());
        const QImage image =
            isDrawn ? job.images.at(static_cast<qsizetype>(i)) : QImage(job.path(SUFFIXES[i]));
        encoders.push_back(FastPng::fastestFor(image, isDrawn ? BareFiles::processors() : 1));
    }
}

void encodePictures(benchmark::State& state, const Job& job, Encoders& encoders)
{
    prepare(encoders, job);
    for ([[maybe_unused]] auto _ : state)
        for (std::size_t i = 0; i < encoders.size(); ++i)
            if (!BareFiles::write(job.path(SUFFIXES[i]), encoders[i]->encode()))
                state.SkipWithError("a file cannot be written");
    for (std::size_t i = 0; i < encoders.size(); ++i) {
        const QImage read(job.path(SUFFIXES[i]));
        if (read != encoders[i]->image().convertToFormat(read.format()))
            state.SkipWithError("the floor is not lossless");
    }
}

void encodeBig(benchmark::State& state, const Job& job)
{
    const QImage& big = job.images.at(0);
    QByteArray file;
    for ([[maybe_unused]] auto _ : state)
        file = PngWriter::encode(big);
    state.counters["kB"] = static_cast<double>(file.size()) / 1000;
    if (QImage::fromData(file) != big.convertToFormat(QImage::Format_ARGB32))
        state.SkipWithError("the pixels of the file are not those of the picture");
}

void encodeBigFast(benchmark::State& state, const Job& job, Encoders& encoders)
{
    prepare(encoders, job);
    const QImage& big = job.images.at(0);
    QByteArray file;
    for ([[maybe_unused]] auto _ : state)
        file = encoders.front()->encode();
    state.counters["kB"] = static_cast<double>(file.size()) / 1000;
    if (QImage::fromData(file) != big.convertToFormat(QImage::Format_ARGB32))
        state.SkipWithError("the floor is not lossless");
}

} // namespace

void Topics::addPictures(PairList& list, const BenchEnvironment& environment)
{
    BenchTitles::writeChecker();
    const std::string folder = environment.makeFolder(QStringLiteral("pictures")).toStdString();
    const auto add = [&](const std::string& kind, double encodingAim, bool isPhotograph) {
        const auto kept = std::make_shared<Job>();
        // Made when it is measured first.
        const auto job = [kept, path = folder + '/' + kind + ".xml", isPhotograph]() -> const Job& {
            if (kept->images.isEmpty())
                *kept =
                    makeJob(path, isPhotograph ? BenchTitles::photograph(ThumbnailRender::THUMBNAIL_BIG_SIZE)
                                               : QImage());
            return *kept;
        };
        const auto encoders = std::make_shared<Encoders>();
        list.add(
            {"pictures_" + kind, AIM, PairList::Clock::Wall}, benchmark::kMillisecond,
            [job](benchmark::State& state) { savePictures(state, job()); },
            [job, encoders](benchmark::State& state) { encodePictures(state, job(), *encoders); });
        list.add(
            {"encode_" + kind, encodingAim, PairList::Clock::Process}, benchmark::kMillisecond,
            [job](benchmark::State& state) { encodeBig(state, job()); },
            [job, encoders](benchmark::State& state) { encodeBigFast(state, job(), *encoders); });
    };
    add("transparent", TRANSPARENT_AIM, false);
    add("photograph", PHOTOGRAPH_AIM, true);
}

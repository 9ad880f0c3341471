// The four picture files of a title, compared with encoding the same pictures as fast as the libraries
// available can.
#include "bench/BenchEnvironment.h"
#include "bench/BenchTitles.h"
#include "bench/FastPng.h"
#include "bench/PairList.h"
#include "bench/Topics.h"
#include "document/ImageResizer.h"
#include "document/PngWriter.h"
#include "library/PictureThread.h"
#include "library/ThumbnailRender.h"
#include "support/AtomicFile.h"

#include <QDir>
#include <QPainter>
#include <QThread>
#include <array>
#include <future>
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

void writeChecker()
{
    const QString folder =
        qEnvironmentVariable("K2SYS_AC_DATA") + QStringLiteral("/defaultuser/resources/Templates");
    QDir().mkpath(folder);
    QImage checker(PictureThread::THUMBNAIL_SMALL_SIZE, QImage::Format_RGB32);
    checker.fill(Qt::gray);
    checker.save(folder + QStringLiteral("/checker_240x135.png"));
}

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

// Encodes and writes the pictures from first up to last.
bool writePictures(const Job& job, const std::vector<QImage>& images,
                   std::vector<std::unique_ptr<FastPng>>& pngs, std::size_t first, std::size_t last)
{
    for (std::size_t i = first; i < last; ++i) {
        const QByteArray bytes = pngs[i]->encode(images[i]);
        if (!AtomicFile::write(job.path(SUFFIXES[i]).toStdString(),
                               {bytes.constData(), static_cast<std::size_t>(bytes.size())},
                               AtomicFile::Durability::SyncLater))
            return false;
    }
    return true;
}

void encodePictures(benchmark::State& state, const Job& job)
{
    PictureThread thread;
    runThread(thread, job);
    std::vector<QImage> images = {job.images.at(0), job.images.at(1)};
    for (std::size_t i = images.size(); i < SUFFIXES.size(); ++i)
        images.emplace_back(job.path(SUFFIXES[i]));
    std::vector<std::unique_ptr<FastPng>> pngs;
    for (const QImage& image : images)
        pngs.push_back(FastPng::fastestFor(image));
    for ([[maybe_unused]] auto _ : state) {
        // The big picture takes longer than the others together.
        auto big = std::async(std::launch::async, [&] { return writePictures(job, images, pngs, 0, 1); });
        if (!writePictures(job, images, pngs, 1, images.size()) || !big.get())
            state.SkipWithError("a file cannot be written");
    }
    for (std::size_t i = 0; i < images.size(); ++i) {
        const QImage read(job.path(SUFFIXES[i]));
        if (read != images[i].convertToFormat(read.format()))
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

void encodeBigFast(benchmark::State& state, const Job& job)
{
    const QImage& big = job.images.at(0);
    const std::unique_ptr<FastPng> png = FastPng::fastestFor(big);
    QByteArray file;
    for ([[maybe_unused]] auto _ : state)
        file = png->encode(big);
    state.counters["kB"] = static_cast<double>(file.size()) / 1000;
    if (QImage::fromData(file) != big.convertToFormat(QImage::Format_ARGB32))
        state.SkipWithError("the floor is not lossless");
}

} // namespace

void Topics::addPictures(PairList& list, const BenchEnvironment& environment)
{
    writeChecker();
    const std::string folder = environment.makeFolder(QStringLiteral("pictures")).toStdString();
    const auto add = [&](const std::string& kind, double encodingAim, const QImage& background) {
        const Job job = makeJob(folder + '/' + kind + ".xml", background);
        list.add(
            {"pictures_" + kind, AIM, PairList::Clock::Wall}, benchmark::kMillisecond,
            [job](benchmark::State& state) { savePictures(state, job); },
            [job](benchmark::State& state) { encodePictures(state, job); });
        list.add(
            {"encode_" + kind, encodingAim, PairList::Clock::Process}, benchmark::kMillisecond,
            [job](benchmark::State& state) { encodeBig(state, job); },
            [job](benchmark::State& state) { encodeBigFast(state, job); });
    };
    add("transparent", TRANSPARENT_AIM, {});
    add("photograph", PHOTOGRAPH_AIM, BenchTitles::photograph(ThumbnailRender::THUMBNAIL_BIG_SIZE));
}

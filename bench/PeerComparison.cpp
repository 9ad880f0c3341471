#include "bench/PeerComparison.h"

#include "bench/BareFiles.h"
#include "bench/MarkedTable.h"
#include "bench/PeerBatch.h"
#include "bench/Statistics.h"

#include <QElapsedTimer>
#include <QFile>
#include <QStandardPaths>
#include <algorithm>
#include <atomic>
#include <cstdio>
#include <fcntl.h>
#include <sched.h>
#include <spawn.h>
#include <string>
#include <sys/resource.h>
#include <sys/wait.h>
#include <thread>
#include <unistd.h>

namespace
{

constexpr int TITLES = 24;
constexpr int PICTURES = 4;
constexpr double NANOSECONDS = 1e9;
constexpr double MICROSECONDS = 1e6;
constexpr double MILLISECONDS = 1000;
const QStringList HEAD = {"Program", "Processors", "processor [ms a title]", "wall [ms a title]", "Remark"};

// Runs a command to its end on the processors of this thread. Returns its processor time in seconds; -1 when
// it fails.
double execute(const QStringList& command)
{
    std::vector<std::string> words;
    for (const QString& word : command)
        words.push_back(word.toStdString());
    std::vector<char*> arguments;
    for (std::string& word : words)
        arguments.push_back(word.data());
    arguments.push_back(nullptr);
    posix_spawn_file_actions_t actions;
    posix_spawn_file_actions_init(&actions);
    for (const int stream : {STDOUT_FILENO, STDERR_FILENO})
        posix_spawn_file_actions_addopen(&actions, stream, "/dev/null", O_WRONLY, 0);
    pid_t child = 0;
    const int error = posix_spawnp(&child, arguments.front(), &actions, nullptr, arguments.data(), environ);
    posix_spawn_file_actions_destroy(&actions);
    int status = 0;
    rusage usage{};
    if (error != 0 || wait4(child, &status, 0, &usage) != child || !WIFEXITED(status) ||
        WEXITSTATUS(status) != 0)
        return -1;
    double seconds = 0;
    for (const timeval& time : {usage.ru_utime, usage.ru_stime})
        seconds += static_cast<double>(time.tv_sec) + static_cast<double>(time.tv_usec) / MICROSECONDS;
    return seconds;
}

// Keeps this thread and the processes that it starts on some of the first processors.
void useProcessors(int first, int count)
{
    cpu_set_t processors;
    CPU_ZERO(&processors);
    for (int i = first; i < first + count; ++i)
        CPU_SET(i, &processors);
    sched_setaffinity(0, sizeof processors, &processors);
}

QStringList ourPictures(const QString& folder, int number)
{
    const QString stem = PeerBatch::titlePath(folder, number).chopped(4);
    return {stem + "_1920.png", stem + "_960.png", stem + "_240S.png", stem + "_240.png"};
}

template <typename Path>
QStringList fourPictures(Path path)
{
    QStringList paths;
    for (int i = 0; i < PICTURES; ++i)
        paths.append(path(i));
    return paths;
}

QStringList qtPictures(const QString& folder, int number)
{
    return fourPictures(
        [&](int i) { return PeerBatch::picturePath(folder, QStringLiteral("qt"), number, i); });
}

QStringList svgPictures(const QString& folder, int number)
{
    return fourPictures(
        [&](int i) { return PeerBatch::picturePath(folder, QStringLiteral("svg"), number, i); });
}

// melt counts the pictures of a run from 1.
QString clipPicture(const QString& folder, int picture, int first)
{
    return QStringLiteral("%1/clip_%2_%3_").arg(folder).arg(picture).arg(first);
}

QStringList clipPictures(const QString& folder, int number)
{
    const int first = number < TITLES / 2 ? 0 : TITLES / 2;
    return fourPictures([&](int i) {
        const QString half = clipPicture(folder, i, first) + QString::number(number - first + 1) + ".png";
        return QFile::exists(half) ? half : clipPicture(folder, i, 0) + QString::number(number + 1) + ".png";
    });
}

std::vector<QStringList> ownCommand(const char* role, const QString& folder, int first, int end)
{
    return {{QStringLiteral("/proc/self/exe"), QLatin1String(role), folder, QString::number(first),
             QString::number(end)}};
}

std::vector<QStringList> svgCommands(const QString& folder, int first, int end)
{
    std::vector<QStringList> commands;
    for (int i = first; i < end; ++i) {
        for (int picture = 0; picture < PICTURES; ++picture) {
            constexpr int WIDTHS[PICTURES] = {1920, 960, 240, 240};
            QStringList command = {QStringLiteral("rsvg-convert"),
                                   PeerBatch::svgPath(folder, i),
                                   "-w",
                                   QString::number(WIDTHS[picture]),
                                   "-o",
                                   PeerBatch::picturePath(folder, QStringLiteral("svg"), i, picture)};
            if (picture == 2)
                command += QStringList{QStringLiteral("-b"), QStringLiteral("black")};
            commands.push_back(command);
        }
    }
    return commands;
}

// All titles of one size in one run, so that the start of the program counts little.
std::vector<QStringList> clipCommands(const QString& folder, int first, int end)
{
    std::vector<QStringList> commands;
    for (int picture = 0; picture < PICTURES; ++picture) {
        constexpr const char* SIZES[PICTURES] = {"1920x1080", "960x540", "240x135", "240x135"};
        QStringList command = {QStringLiteral("melt"), "-silent", "-profile", "atsc_1080p_25"};
        for (int i = first; i < end; ++i)
            command += QStringList{PeerBatch::clipPath(folder, i), QStringLiteral("out=0")};
        const bool isOnBlack = picture == 2;
        command += QStringList{"-consumer",
                               "avformat:" + clipPicture(folder, picture, first) + "%d.png",
                               "vcodec=png",
                               isOnBlack ? "pix_fmt=rgb24" : "pix_fmt=rgba",
                               isOnBlack ? "mlt_image_format=rgb" : "mlt_image_format=rgba",
                               "an=1",
                               "real_time=-1",
                               QStringLiteral("s=") + SIZES[picture]};
        commands.push_back(command);
    }
    return commands;
}

} // namespace

PeerComparison::PeerComparison(const QString& folder) : m_folder(folder)
{
}

std::vector<PeerComparison::Program> PeerComparison::programs()
{
    return {
        {"titler", "from its title files, until all is on the disk", ourPictures,
         [](const QString& folder, int first, int end) {
             return ownCommand("--batch-titler", folder, first, end);
         },
         true},
        {"Qt alone", "QTextDocument and QImage::save, without outline and shadow", qtPictures,
         [](const QString& folder, int first, int end) {
             return ownCommand("--batch-qt", folder, first, end);
         }},
        {"melt", "a run for each size of picture", clipPictures, clipCommands},
        {"rsvg-convert", "a run for each picture", svgPictures, svgCommands},
    };
}

PeerComparison::Cost PeerComparison::measure(const Program& program, int processors) const
{
    const int shares = program.usesAllProcessors ? 1 : processors;
    std::atomic<double> seconds = 0;
    std::atomic<bool> isDone = true;
    QElapsedTimer timer;
    timer.start();
    std::vector<std::thread> threads;
    for (int i = 0; i < shares; ++i)
        threads.emplace_back([&, i] {
            useProcessors(i, program.usesAllProcessors ? processors : 1);
            const auto commands = program.commands(m_folder, TITLES * i / shares, TITLES * (i + 1) / shares);
            for (const QStringList& command : commands) {
                const double used = execute(command);
                if (used < 0)
                    isDone = false;
                seconds += used;
            }
        });
    for (std::thread& thread : threads)
        thread.join();
    const double wall = static_cast<double>(timer.nsecsElapsed()) / NANOSECONDS;
    return {seconds, wall, isDone};
}

bool PeerComparison::hasPictures(const Program& program) const
{
    for (int i = 0; i < TITLES; ++i)
        for (const QString& path : program.pictures(m_folder, i))
            if (!QFile::exists(path)) {
                std::fprintf(stderr, "%s made no %s\n", qPrintable(program.name), qPrintable(path));
                return false;
            }
    return true;
}

bool PeerComparison::run()
{
    if (!PeerBatch::writeTitles(m_folder, TITLES))
        return false;
    // melt draws texts only where it sees the name of a display, but does not connect to it.
    if (qEnvironmentVariableIsEmpty("DISPLAY"))
        qputenv("DISPLAY", ":none");
    std::printf("%d titles of four texts, four pictures each\n", TITLES);
    bool isDone = true;
    for (const Program& program : programs()) {
        const QString command = program.commands(m_folder, 0, 1).front().front();
        if (QStandardPaths::findExecutable(command).isEmpty() && !QFile::exists(command)) {
            std::printf("%-14s is not installed\n", qPrintable(program.name));
            continue;
        }
        for (const int processors : {1, std::min(2, BareFiles::processors())}) {
            std::vector<double> used;
            std::vector<double> wall;
            for (int i = 0; i < REPETITIONS; ++i) {
                const Cost cost = measure(program, processors);
                isDone = isDone && cost.isDone;
                used.push_back(cost.processor * MILLISECONDS / TITLES);
                wall.push_back(cost.wall * MILLISECONDS / TITLES);
            }
            isDone = isDone && hasPictures(program);
            const auto number = [](const std::vector<double>& values) {
                return QString::number(Statistics::median(values), 'f', 1);
            };
            m_rows.push_back(
                {program.name, QString::number(processors), number(used), number(wall), program.remark});
            std::printf("%-14s on %d: %7s ms of processor time a title, %7s ms wall (%s)\n",
                        qPrintable(program.name), processors, qPrintable(number(used)),
                        qPrintable(number(wall)), qPrintable(program.remark));
            std::fflush(stdout);
        }
    }
    return isDone;
}

QStringList PeerComparison::table() const
{
    QStringList lines = {MarkedTable::row(HEAD),
                         QLatin1Char('|') + QStringLiteral("---|").repeated(HEAD.size())};
    for (const QStringList& row : m_rows)
        lines.append(MarkedTable::row(row));
    return lines;
}

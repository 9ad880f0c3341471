#include "bench/BareFiles.h"

#include <QFile>
#include <QImageReader>
#include <QThread>
#include <algorithm>
#include <atomic>
#include <cstdio>
#include <future>
#include <tinyxml.h>

namespace
{

// Calls work for each path. Each thread takes the next path that is left.
template <typename Work>
bool forEach(const std::vector<std::string>& paths, Work work)
{
    std::atomic<std::size_t> next = 0;
    std::atomic<bool> isDone = true;
    const auto run = [&] {
        for (std::size_t i = next++; i < paths.size(); i = next++)
            if (!work(paths[i]))
                isDone = false;
    };
    {
        std::vector<std::future<void>> others; // waited for at the end of the block
        for (int i = 1; i < BareFiles::processors(); ++i)
            others.push_back(std::async(std::launch::async, run));
        run();
    }
    return isDone;
}

} // namespace

bool BareFiles::load(const std::vector<std::string>& paths)
{
    return forEach(paths, [](const std::string& path) { return TiXmlDocument().LoadFile(path.c_str()); });
}

bool BareFiles::decode(const std::vector<std::string>& paths)
{
    return forEach(paths, [](const std::string& path) {
        return !QImageReader(QString::fromStdString(path)).read().isNull();
    });
}

bool BareFiles::write(const QString& path, const QByteArray& bytes)
{
    QFile file(path + QStringLiteral(".new"));
    if (!file.open(QIODevice::WriteOnly) || file.write(bytes) != bytes.size())
        return false;
    file.close();
    return std::rename(file.fileName().toLocal8Bit().constData(), path.toLocal8Bit().constData()) == 0;
}

int BareFiles::processors()
{
    return std::max(1, QThread::idealThreadCount());
}

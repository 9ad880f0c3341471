#include "messaging/services/TitlerParams.h"

#include <algorithm>

simplebuffer TitlerParams::packPaths(const std::vector<std::wstring>& paths)
{
    simplebuffer buffer;
    CSimpleBuffer::simplebuffer_init(&buffer, nullptr, 0);
    for (std::size_t i = 0; i < std::min(paths.size(), MOST_PATHS); ++i)
        RecordPacking::pack(&buffer, paths[i]);
    return buffer;
}

std::vector<std::wstring> TitlerParams::unpackPaths(const _CALLBACK_TITLER_PARAMTER& result)
{
    std::vector<std::wstring> paths;
    RecordReader reader(result.data, result.size);
    for (int i = 0; i < result.count && !reader.atEnd(); ++i) {
        std::wstring path = reader.readWide();
        if (reader.failed())
            break;
        paths.push_back(std::move(path));
    }
    return paths;
}

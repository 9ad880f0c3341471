// Runs a fuzz target on files: each argument is a file, or a folder whose files are all used. The exit code
// is 1 when there are no files; a problem found by the target or a sanitizer ends the process.
#include <algorithm>
#include <cstdint>
#include <cstdio>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <vector>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size);

namespace
{

namespace fs = std::filesystem;

std::vector<fs::path> filesOf(const fs::path& place)
{
    std::vector<fs::path> files;
    if (fs::is_directory(place)) {
        for (const fs::directory_entry& entry : fs::directory_iterator(place))
            if (entry.is_regular_file())
                files.push_back(entry.path());
        std::sort(files.begin(), files.end());
    } else if (fs::is_regular_file(place)) {
        files.push_back(place);
    }
    return files;
}

void run(const fs::path& path)
{
    std::printf("%s\n", path.c_str());
    std::fflush(stdout);
    std::ifstream file(path, std::ios::binary);
    // Exactly as long as the file, so that a sanitizer detects reads beyond the end.
    const std::vector<char> bytes{std::istreambuf_iterator<char>(file), {}};
    LLVMFuzzerTestOneInput(reinterpret_cast<const std::uint8_t*>(bytes.data()), bytes.size());
}

} // namespace

int main(int argc, char** argv)
{
    std::size_t count = 0;
    for (int i = 1; i < argc; ++i) {
        for (const fs::path& path : filesOf(argv[i])) {
            run(path);
            ++count;
        }
    }
    std::printf("%zu files\n", count);
    return count > 0 ? 0 : 1;
}

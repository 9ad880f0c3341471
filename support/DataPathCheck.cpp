#include "support/DataPathCheck.h"

#include "support/LocaleText.h"
#include "support/PathManagerEx.h"
#include "support/k2sys/k2sys.h"

#include <fcntl.h>
#include <unistd.h>

#include <boost/filesystem.hpp>

#include <cerrno>
#include <climits>
#include <cstring>

namespace DataPathCheck
{

namespace
{

// Returns the path in quotes, with control characters replaced so that it stays on one line.
std::string quoted(const std::string& path)
{
    std::string text = "\"";
    for (const char c : path) {
        const bool isControl = static_cast<unsigned char>(c) < ' ' || c == 127;
        text += isControl ? '?' : c;
    }
    return text + "\"";
}

// Returns 0, or the errno that prevents the creation of files in the folder. A full disk is not reported.
int writeError(const std::string& folder)
{
    const int file = open(folder.c_str(), O_TMPFILE | O_RDWR | O_CLOEXEC, S_IRUSR | S_IWUSR);
    if (file != -1) {
        close(file);
        return 0;
    }
    switch (errno) {
    case ENOSPC:
    case EDQUOT:
        return 0;
    case EOPNOTSUPP: // the file system does not support O_TMPFILE
    case EISDIR:
    case ENOENT:
        return access(folder.c_str(), W_OK | X_OK) == 0 ? 0 : errno;
    default:
        return errno;
    }
}

std::string unwritable(const std::string& path, const std::string& reason)
{
    return "the data path " + quoted(path) + " cannot be written: " + reason;
}

} // namespace

std::string problem()
{
    char text[PATH_MAX] = {};
    const bool fits = k2sys_getenv_ac_data(text, sizeof text) > 0;
    const std::string path = text;
    if (!fits || path.size() > MAX_LENGTH) {
        const std::string length =
            fits ? std::to_string(path.size()) : "more than " + std::to_string(PATH_MAX);
        return "the data path " + quoted(path) + " is too long: " + length + " bytes, and at most " +
               std::to_string(MAX_LENGTH) + " are possible";
    }
    if (path.empty() || path.front() != '/')
        return "the data path " + quoted(path) + " is not absolute";
    const std::string folder = wideToMultiByte(PathManagerEx().getDefaultPath());
    if (folder.empty() || folder.front() != '/')
        return std::string(); // relative to the working directory; not checked
    boost::system::error_code error;
    boost::filesystem::create_directories(folder, error);
    if (error)
        return unwritable(path, error.message());
    const int refusal = writeError(folder);
    return refusal == 0 ? std::string() : unwritable(path, std::strerror(refusal));
}

} // namespace DataPathCheck

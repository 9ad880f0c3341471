// The platform library's environment and file-system queries, and file operations on top of them.
// Paths are UTF-8 or wide strings. File operations report by their result and throw nothing. Any thread.
#pragma once

#include <boost/filesystem/path.hpp>
#include <ctime>
#include <string>

class SystemInfo
{
public:
    // The one instance, made on first use; cleanUp deletes it. The operations below do not need it.
    static SystemInfo* getInstance();
    static void cleanUp();

    // Start and end the platform library.
    static bool initialize();
    static void uninitialize();

    // Environment of the appliance; empty on failure.
    static std::wstring getRootPath();
    static std::wstring getDataPath();
    static std::wstring getPrefixPath();

    // Current local time. The caller owns *now and deletes it; null on failure.
    static bool getSystemTime(std::tm** now);

    // "Asia" and "Tokyo" when the platform does not know its zone.
    static void getSystemTimeZone(std::wstring& region, std::wstring& city);

    // Of the file system that holds path, in kilobytes of 1,000 bytes; negative when that cannot be told.
    static long long getDiskSize(const std::wstring& path);
    static long long getDiskRemainSize(const std::wstring& path);

    // Sum of the sizes of all files in a folder and its sub-folders, in kilobytes of 1,000 bytes, rounded up.
    static long long getFolderSize(const std::wstring& folder);

    // Removes one file or one empty folder.
    static bool deleteFile(const std::string& path);

    // Copies a file, or a folder with all it holds, making folders as it goes. Existing files are
    // overwritten. A file is never seen half-copied.
    static bool copyFile(const boost::filesystem::path& source, const boost::filesystem::path& target);

    // All that a folder holds, into another folder.
    static bool copyFolderFiles(const std::string& source, const std::string& target);

    // One entry of a folder, file or folder, to a path in another.
    static bool copyFolderFile(const std::string& source, const std::string& target);

    // Makes a folder and those above it. True when it is there afterwards and was not before.
    static bool createFolders(const std::wstring& folder);

    static std::wstring stringToWstring(const std::string& text);
    static std::string wstringToStringType(const std::wstring& text);

private:
    SystemInfo() = default;
    static SystemInfo* mInstance;
};

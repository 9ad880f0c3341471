#pragma once

#include <boost/filesystem/path.hpp>
#include <ctime>
#include <string>

// The platform library's environment and file-system queries, and file operations on top of them. Paths are
// UTF-8 or wide strings. File operations report errors by their result and do not throw. Any thread.
class SystemInfo
{
public:
    // Returns the only instance, which is created on first use; cleanUp deletes it. The operations below do
    // not need it.
    static SystemInfo* getInstance();
    static void cleanUp();

    // Start and end the platform library.
    static bool initialize();
    static void uninitialize();

    // Return paths from the environment of the appliance; empty on failure.
    static std::wstring getRootPath();
    static std::wstring getDataPath();
    static std::wstring getPrefixPath();

    // Gets the current local time. The caller owns *now and deletes it; null on failure.
    static bool getSystemTime(std::tm** now);

    // Gets the zone of the platform, or "Asia" and "Tokyo" if that is unknown.
    static void getSystemTimeZone(std::wstring& region, std::wstring& city);

    // Return total and free size of the file system that holds path, in kilobytes of 1,000 bytes; negative if
    // unknown.
    static long long getDiskSize(const std::wstring& path);
    static long long getDiskRemainSize(const std::wstring& path);

    // Returns the sum of the sizes of all files in a folder and its sub-folders, in kilobytes of 1,000 bytes,
    // rounded up.
    static long long getFolderSize(const std::wstring& folder);

    // Deletes one file or one empty folder.
    static bool deleteFile(const std::string& path);

    // Copies a file, or a folder with its contents, and creates missing folders. Existing files are
    // overwritten. Other processes never see a partly copied file.
    static bool copyFile(const boost::filesystem::path& source, const boost::filesystem::path& target);

    // Copies the contents of a folder into another folder.
    static bool copyFolderFiles(const std::string& source, const std::string& target);

    // Copies one entry of a folder, a file or a folder, to a path in another folder.
    static bool copyFolderFile(const std::string& source, const std::string& target);

    // Creates a folder and its parents. Returns true only if the folder exists now and did not exist before.
    static bool createFolders(const std::wstring& folder);

    static std::wstring stringToWstring(const std::string& text);
    static std::string wstringToStringType(const std::wstring& text);

private:
    SystemInfo() = default;
    static SystemInfo* mInstance;
};

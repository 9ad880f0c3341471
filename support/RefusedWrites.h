#pragma once

#include <cstddef>
#include <functional>
#include <string>
#include <vector>

// Keeps the bytes of files whose write failed in memory until the disk accepts them. Readers of such a file
// in this process get these bytes (see XmlFile), so that an edit is not lost when its title is read again.
// AtomicFile drops the bytes that a later write of the same file has replaced.
//
// All functions may be called from any thread. Only retry accesses the disk; it does not wait for a sync.
class RefusedWrites
{
public:
    // Limit in bytes for all kept pictures; pictures beyond it are dropped. Titles and order files are small
    // and always kept.
    static constexpr std::size_t PICTURE_BYTES = 256 * 1024 * 1024;

    struct File {
        std::string path;
        std::string title; // for a picture: the path of its title file
        int error = 0;     // errno of the last attempt
    };

    // Keeps the bytes that the file at path should have. If title is given, they are a picture of that title
    // and are written only while the title file exists. The folder of path may have been renamed since (see
    // folderRenamed).
    static void keep(const std::string& path, std::string bytes, int error, const std::string& title = {});

    // Returns whether bytes are kept for path; if so, copies them to bytes.
    static bool find(const std::string& path, std::string& bytes);

    static bool isEmpty();
    // Returns how often bytes were kept while none were kept before; each time is the beginning of an outage
    // of the disk.
    static unsigned long outages();
    static std::vector<File> files();

    // Tries to write all kept files again, in the order in which they were kept. Returns those that were
    // written.
    static std::vector<File> retry();

    static void forget(const std::string& path);
    // moment() returns a number that grows with each keep(). forgetUpTo() drops what was kept for path up to
    // that moment.
    static unsigned long moment();
    static void forgetUpTo(unsigned long moment, const std::string& path);
    // Drops all files of a folder and of the folders below it.
    static void forgetFolder(const std::string& folder);
    // Drops the files of folders that no longer exist, and returns them.
    static std::vector<File> forgetVanished();

    // Call after a folder was renamed: what is kept for it, or will be, is written to the new folder.
    static void folderRenamed(const std::string& before, const std::string& after);

    // Sets a function that is called after each keep(), in the thread of keep(); null removes it.
    static void setListener(std::function<void()> listener);
};

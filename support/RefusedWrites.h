// What the disk refused to take: the bytes of files whose write failed, kept in memory until the disk takes
// them. Whoever reads such a file in this process gets these bytes (XmlFile), so that an edit is not undone
// by reading its title again. AtomicFile drops what a later write of the same file has replaced.
//
// All functions may be called from any thread. Only retry touches the disk; it does not wait for it to sync.
#pragma once

#include <cstddef>
#include <functional>
#include <string>
#include <vector>

class RefusedWrites
{
public:
    // Pictures beyond this many bytes in all are dropped; titles and orders are small and always kept.
    static constexpr std::size_t PICTURE_BYTES = 256 * 1024 * 1024;

    struct File {
        std::string path;
        std::string title; // for a picture: the path of its title file
        int error = 0;     // errno of the last try
    };

    // Keeps the bytes that path should have. With a title they are a picture of it, which is written only
    // while the title file is there. The folder of path may have been renamed since (see folderRenamed).
    static void keep(const std::string& path, std::string bytes, int error, const std::string& title = {});

    // Returns whether bytes are kept for path, and what they are.
    static bool find(const std::string& path, std::string& bytes);

    static bool isEmpty();
    // Number of times that bytes were kept while none were: each is the beginning of an outage of the disk.
    static unsigned long outages();
    static std::vector<File> files();

    // Tries all again, in the order in which they were kept. Returns those that are on the disk now.
    static std::vector<File> retry();

    static void forget(const std::string& path);
    // A number that grows with each keep, and the forgetting of what was kept for path up to that moment.
    static unsigned long moment();
    static void forgetUpTo(unsigned long moment, const std::string& path);
    // Forgets all files of a folder and of the folders below it.
    static void forgetFolder(const std::string& folder);
    // Forgets the files of folders that do not exist any more. Returns them.
    static std::vector<File> forgetVanished();

    // The folder has another name now: what is kept for it, or will be, goes there.
    static void folderRenamed(const std::string& before, const std::string& after);

    // Called after each keep, in the thread that called it. Null: nobody is told.
    static void setListener(std::function<void()> listener);
};

#pragma once

#include <cstdint>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <string>
#include <string_view>
#include <sys/stat.h>
#include <unistd.h>

// The data path of a fuzz target: a folder in memory that is removed when the process ends, and the
// environment variables that point to it.
class FuzzFolder
{
public:
    // Returns the folder of this process.
    static FuzzFolder& instance()
    {
        static FuzzFolder folder;
        return folder;
    }

    // Returns the folder that the paths in the path file are relative to, without a slash at its end.
    std::string base() const { return m_root + "/defaultuser"; }

    static void write(const std::string& path, std::string_view bytes)
    {
        std::ofstream file(path, std::ios::binary | std::ios::trunc);
        file.write(bytes.data(), static_cast<std::streamsize>(bytes.size()));
    }

    static std::string_view view(const std::uint8_t* data, std::size_t size)
    {
        return {reinterpret_cast<const char*>(data), size};
    }

    static std::string read(const std::string& path)
    {
        std::ifstream file(path, std::ios::binary);
        return {std::istreambuf_iterator<char>(file), {}};
    }

    // Removes the contents of the folder.
    static void empty(const std::string& folder)
    {
        std::error_code error;
        std::filesystem::remove_all(folder, error);
        std::filesystem::create_directories(folder, error);
    }

private:
    FuzzFolder()
    {
        const char* const memory = "/dev/shm";
        std::string pattern =
            std::string(::access(memory, W_OK) == 0 ? memory : "/tmp") + "/titler-fuzz-XXXXXX";
        if (!::mkdtemp(pattern.data()))
            std::abort();
        m_root = pattern;
        ::setenv("K2SYS_AC_ROOT", "", 1);
        ::setenv("K2SYS_AC_DATA", m_root.c_str(), 1);
        ::setenv("K2SYS_LOG_DIR", m_root.c_str(), 1);
        for (const char* folder : {"/titles", "/settings", "/usertemplates", "/templates/templates_en",
                                   "/templates/templates_chs", "/resources/Templates"})
            std::filesystem::create_directories(base() + folder);
        write(base() + "/PathInfo.xml",
              "<?xml version=\"1.0\"?><PathInfo><TitleResource path=\"titles\"/>"
              "<SystemSetting path=\"settings\"/><TitlerTemplate path=\"usertemplates\"/>"
              "<Template path=\"templates\"/><Font path=\"fonts\"/></PathInfo>");
    }
    ~FuzzFolder()
    {
        std::error_code error;
        std::filesystem::remove_all(m_root, error);
    }

    std::string m_root;
};

// A fresh folder for one test, removed with everything in it when the test ends.
#pragma once

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <string>

namespace orvtest {

class TempDir {
public:
    TempDir() {
        std::string pattern = (std::filesystem::temp_directory_path() / "orvtest-XXXXXX").string();
        if (char* made = ::mkdtemp(pattern.data())) {
            path_ = made;
        }
    }
    ~TempDir() {
        std::error_code ec;
        std::filesystem::remove_all(path_, ec);
    }
    TempDir(TempDir const&) = delete;
    TempDir& operator=(TempDir const&) = delete;

    std::filesystem::path const& Path() const { return path_; }
    std::u16string U16() const { return PathU16(path_); }
    std::u16string U16(std::string const& name) const { return PathU16(path_ / name); }

    // Writes a file inside the folder and returns its path.
    std::filesystem::path Write(std::string const& name, std::string const& bytes) const {
        std::ofstream(path_ / name, std::ios::binary) << bytes;
        return path_ / name;
    }

    static std::u16string PathU16(std::filesystem::path const& p) {
        std::string s = p.string();
        return std::u16string(s.begin(), s.end()); // test paths are ASCII
    }

private:
    std::filesystem::path path_;
};

inline std::string ReadFile(std::filesystem::path const& p) {
    std::ifstream in(p, std::ios::binary);
    return std::string(std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>());
}

} // namespace orvtest

#pragma once

#include <gtest/gtest.h>
#include <unistd.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <stdexcept>
#include <string>
#include <vector>

namespace orvela {

/// The rows of a table in the tests' data: cells parted by " | ", lines that begin with # left out. A table
/// without rows is an exception.
inline std::vector<std::vector<std::string>> tableRows(const std::string& name) {
    std::ifstream file(ORVELA_TEST_DATA "/" + name);
    std::vector<std::vector<std::string>> rows;
    for (std::string line; std::getline(file, line);) {
        if (line.starts_with('#'))
            continue;
        std::vector<std::string>& cells = rows.emplace_back();
        for (std::size_t end; (end = line.find(" | ")) != std::string::npos; line.erase(0, end + 3))
            cells.push_back(line.substr(0, end));
        cells.push_back(line);
    }
    if (rows.empty())
        throw std::runtime_error("no rows in " + name);
    return rows;
}

/// A folder of its own for one test, removed with everything in it; shell commands run there with $S naming
/// the sample photographs.
class TestFolder {
public:
    TestFolder() {
        std::string name = (std::filesystem::temp_directory_path() / "orvela-XXXXXX").string();
        mPath = ::mkdtemp(name.data());
        ::setenv("S", ORVELA_SAMPLES, 1);
    }
    ~TestFolder() { std::filesystem::remove_all(mPath); }

    const std::filesystem::path& path() const { return mPath; }
    std::filesystem::path operator/(const std::string& name) const { return mPath / name; }

    /// A command that fails, or is missing, fails the test.
    void run(const std::string& command) const {
        EXPECT_EQ(std::system(("cd " + mPath.string() + " && ( " + command + " ) >log 2>&1").c_str()), 0)
            << command << "\n"
            << text("log");
    }
    std::string output(const std::string& command) const {
        run("( " + command + " ) >out");
        return text("out");
    }
    std::string text(const std::string& name) const {
        std::ifstream file(mPath / name, std::ios::binary);
        return {std::istreambuf_iterator<char>(file), {}};
    }
    void put(const std::string& name, const std::string& bytes) const {
        std::ofstream(mPath / name, std::ios::binary) << bytes;
    }
    std::size_t count() const {
        using Files = std::filesystem::directory_iterator;
        return static_cast<std::size_t>(std::distance(Files(mPath), Files()));
    }

private:
    std::filesystem::path mPath;
};

} // namespace orvela

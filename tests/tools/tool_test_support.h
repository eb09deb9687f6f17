// Shared pieces of the program's tests: library registration, a scratch directory, small line jobs.
#pragma once

#include "tools/job_json.h"

#include <filesystem>
#include <string>
#include <vector>

namespace ToolTest {

using Norvane::Lumis::Scanning::Tool::Json;

// Registers every class of the library and its sibling components (idempotent).
void RegisterLibrary();

// A new empty directory, removed with everything in it when the object goes.
class TemporaryDirectory {
  public:
    TemporaryDirectory();
    ~TemporaryDirectory();
    TemporaryDirectory(const TemporaryDirectory&) = delete;
    TemporaryDirectory& operator=(const TemporaryDirectory&) = delete;

    const std::filesystem::path& Path() const { return path_; }
    std::filesystem::path operator/(const std::string& name) const { return path_ / name; }
    // Names of the entries, sorted; temporary files show up here too.
    std::vector<std::string> Entries() const;

  private:
    std::filesystem::path path_;
};

std::string ReadFile(const std::filesystem::path& path);
void WriteFile(const std::filesystem::path& path, const std::string& text);
std::vector<std::string> Lines(const std::string& text);

// A horizontal line from (0.25, 0.5) to (0.75, 0.5) with pitch 0.125: length 0.5 / 0.125 = 4 whole pitches,
// so 5 pattern points, all in exact binary fractions. With the default rendering properties one
// pre-blanking, one asymmetry and one post-blanking point frame them: 8 points.
Json SmallLineJob();

} // namespace ToolTest

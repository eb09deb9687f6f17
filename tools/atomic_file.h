// Output files that appear whole or not at all.
#pragma once

#include <filesystem>
#include <fstream>
#include <string>

namespace Norvane::Lumis::Scanning::Tool {

// A file written under a temporary name in its target's directory and renamed onto the target only on
// Commit, so a failed run never leaves a half-written file. A file not committed is removed again when
// the object goes. Failures throw ToolError naming the option and the path.
class PendingFile {
  public:
    // label names the file in messages, e.g. the option that asked for it ("--points").
    PendingFile(std::filesystem::path target, std::string label);
    ~PendingFile();
    PendingFile(const PendingFile&) = delete;
    PendingFile& operator=(const PendingFile&) = delete;

    std::ostream& Stream() { return stream_; }
    // Flushes and closes the temporary file, checking that everything was written.
    void Close();
    // Renames the closed temporary file onto the target.
    void Commit();

  private:
    void RemoveTemporary();
    [[noreturn]] void Fail(const std::string& what) const;

    std::filesystem::path target_;
    std::string label_;
    std::filesystem::path temporary_;
    std::ofstream stream_;
    bool committed_ = false;
};

} // namespace Norvane::Lumis::Scanning::Tool

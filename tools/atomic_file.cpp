#include "tools/atomic_file.h"

#include "tools/tool_error.h"

#include <cerrno>
#include <cstring>
#include <sys/stat.h>
#include <unistd.h>

namespace Norvane::Lumis::Scanning::Tool {

namespace {

// What a new file gets from the process's umask; mkstemp itself creates files readable by the owner only.
mode_t NewFileMode() {
    const mode_t mask = umask(0);
    umask(mask);
    return 0666 & ~mask;
}

// A new empty file next to the target with a unique name; -1 and errno on failure.
int CreateTemporary(const std::filesystem::path& target, std::filesystem::path& created) {
    const std::filesystem::path directory = target.has_parent_path() ? target.parent_path() : ".";
    std::string name = (directory / ("." + target.filename().string() + ".XXXXXX")).string();
    const int descriptor = mkstemp(name.data());
    if (descriptor >= 0)
        created = name;
    return descriptor;
}

} // namespace

PendingFile::PendingFile(std::filesystem::path target, std::string label)
    : target_(std::move(target)), label_(std::move(label)) {
    std::error_code error;
    if (target_.filename().empty() || std::filesystem::is_directory(target_, error))
        Fail("it names a directory");
    const int descriptor = CreateTemporary(target_, temporary_);
    if (descriptor < 0)
        Fail(std::string("cannot create the file: ") + std::strerror(errno));
    const bool madeReadable = fchmod(descriptor, NewFileMode()) == 0;
    const int savedErrno = errno;
    close(descriptor);
    if (madeReadable)
        stream_.open(temporary_, std::ios::binary | std::ios::trunc);
    if (!stream_.is_open()) {
        const std::string reason = std::strerror(madeReadable ? errno : savedErrno);
        RemoveTemporary();
        Fail("cannot create the file: " + reason);
    }
}

PendingFile::~PendingFile() {
    if (!committed_)
        RemoveTemporary();
}

void PendingFile::RemoveTemporary() {
    stream_.close();
    std::error_code ignored;
    std::filesystem::remove(temporary_, ignored);
}

void PendingFile::Close() {
    stream_.flush();
    const bool written = static_cast<bool>(stream_);
    stream_.close();
    if (!written || stream_.fail())
        Fail(std::string("cannot write the file: ") + std::strerror(errno));
}

void PendingFile::Commit() {
    std::error_code error;
    std::filesystem::rename(temporary_, target_, error);
    if (error)
        Fail("cannot move the finished file into place: " + error.message());
    committed_ = true;
}

void PendingFile::Fail(const std::string& what) const {
    throw ToolError(label_ + " " + target_.string() + ": " + what);
}

} // namespace Norvane::Lumis::Scanning::Tool

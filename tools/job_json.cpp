#include "tools/job_json.h"

#include "tools/tool_error.h"

#include <cerrno>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <set>
#include <sstream>
#include <vector>

namespace Norvane::Lumis::Scanning::Tool {

namespace {

// "[json.exception.parse_error.101] parse error at line 1, ..." without the bracketed exception name.
std::string WithoutExceptionName(const std::string& what) {
    const auto end = what.find("] ");
    return what.front() == '[' && end != std::string::npos ? what.substr(end + 2) : what;
}

// Tracks the keys of every open object while the parser reads, and refuses a key seen before in the
// same object. Arrays get an entry too, so the stack follows the nesting.
class DuplicateKeyCheck {
  public:
    explicit DuplicateKeyCheck(const std::string& source) : source_(source) {}

    bool operator()(int, Json::parse_event_t event, Json& parsed) {
        switch (event) {
        case Json::parse_event_t::object_start:
        case Json::parse_event_t::array_start:
            open_.emplace_back();
            break;
        case Json::parse_event_t::object_end:
        case Json::parse_event_t::array_end:
            open_.pop_back();
            break;
        case Json::parse_event_t::key:
            if (!open_.back().insert(parsed.get<std::string>()).second)
                throw ToolError(source_ + ": malformed job: the key \"" + parsed.get<std::string>() +
                                "\" appears twice in one object");
            break;
        case Json::parse_event_t::value:
            break;
        }
        return true;
    }

  private:
    const std::string& source_;
    std::vector<std::set<std::string>> open_;
};

std::string ReadWholeFile(const std::string& path) {
    std::error_code error;
    if (std::filesystem::is_directory(path, error))
        throw ToolError(path + ": cannot read the job file: it is a directory");
    std::ifstream in(path, std::ios::binary);
    if (!in)
        throw ToolError(path + ": cannot read the job file: " + std::strerror(errno));
    std::ostringstream text;
    text << in.rdbuf();
    if (in.bad())
        throw ToolError(path + ": cannot read the job file: " + std::strerror(errno));
    return text.str();
}

} // namespace

Json ParseJob(std::string_view text, const std::string& source) {
    Json job;
    try {
        DuplicateKeyCheck check(source);
        job = Json::parse(text.begin(), text.end(), std::ref(check));
    } catch (const Json::exception& error) {
        // A parse error, or a number too large for a double ("1e400"), which the parser reports apart.
        throw ToolError(source + ": malformed JSON: " + WithoutExceptionName(error.what()));
    }
    if (!job.is_object())
        throw ToolError(source + ": malformed job: a job is one JSON object with a \"class\" key");
    return job;
}

Json ReadJobFile(const std::string& path) {
    return ParseJob(ReadWholeFile(path), path);
}

} // namespace Norvane::Lumis::Scanning::Tool

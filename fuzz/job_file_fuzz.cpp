// Feeds arbitrary bytes to the job-file reader and applies what parses to a line pattern. Malformed text
// and refused values must end in the program's one error type; anything else escaping, or a sanitizer
// report, is a fault. Jobs naming other classes are only parsed: containers such as the point list have
// methods that allocate whatever size the job asks for, which is the job's right and no finding.

#include "module/class_table.h"
#include "tools/job_file.h"
#include "tools/job_json.h"
#include "tools/tool_error.h"

#include <cstddef>
#include <cstdint>
#include <string_view>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    using namespace Norvane::Lumis::Scanning;
    static const bool registered = (RegisterComponents(), true);
    (void)registered;
    try {
        const Tool::Json job =
            Tool::ParseJob(std::string_view(reinterpret_cast<const char*>(data), size), "fuzz");
        if (job.value("class", Tool::Json()) == "PatternLine")
            Tool::ApplyJob(job);
    } catch (const Tool::ToolError&) {
    }
    return 0;
}

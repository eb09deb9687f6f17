// Reading job files: JSON text into a document that keeps its keys in file order, so properties are
// applied in the order the file gives them.
#pragma once

#include <nlohmann/json.hpp>

#include <string>
#include <string_view>

namespace Norvane::Lumis::Scanning::Tool {

using Json = nlohmann::ordered_json;

// Parses a job. A job is one JSON object; a key given twice in one object is refused rather than letting
// the later value win unseen. Failures throw ToolError naming source ("job.json: malformed JSON: ...").
Json ParseJob(std::string_view text, const std::string& source);

// Reads and parses a job file; an unreadable file throws ToolError naming the path.
Json ReadJobFile(const std::string& path);

} // namespace Norvane::Lumis::Scanning::Tool

#include "tools/builtin_example.h"

namespace Norvane::Lumis::Scanning::Tool {

std::string_view BuiltinExampleJob() {
    return R"({
  "class": "PatternLine",
  "Begin": [0.1, 0.8],
  "End": [0.9, 0.2],
  "Pitch": 0.001,
  "BeginDwellTime": 1e-6,
  "EndDwellTime": 2e-5,
  "RenderingProperties": {
    "PreBlankingTime": 2e-6,
    "PostBlankingTime": 1e-6
  }
}
)";
}

} // namespace Norvane::Lumis::Scanning::Tool

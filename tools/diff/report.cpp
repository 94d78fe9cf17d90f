// SPDX-License-Identifier: MIT
#include "tools/diff/report.hpp"

namespace qz::tools::diff {

std::vector<ReportFormat> reportFormats() { return {{"text", writeText}, {"json", writeJson}}; }

}  // namespace qz::tools::diff

#pragma once

#include "app/buildtool/buildrequest.h"
#include "automation/contract/application.h"

#include <cstdint>
#include <functional>
#include <vector>

namespace penmoor {

// Turns a picture into the bytes of a PNG file.
using PngEncoder = std::function<std::vector<std::uint8_t>(const xl::Picture&)>;

// Builds the workbook of the request as "Start Creating Template" does, with the same item
// list, sheet builder, spreadsheet application and save, but stops at the first failure. The
// workbook is saved under a temporary name in the output folder and moved to its own name
// last, after the picture (taken from the saved workbook reopened, as the preview shows it)
// has replaced its file in one step; so after a failure no new file stands under either name
// and a file that was there is left as it was. Raises std::exception with the error text.
// encodePng is used only when a picture is asked for.
void runHeadlessBuild(
    const BuildRequest& request, xl::ApplicationFactory& spreadsheets, const PngEncoder& encodePng, int currentYear);

} // namespace penmoor

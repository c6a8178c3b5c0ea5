#include "nrxctl/decoders/event_text.h"

#include <cstdlib>

#include "nrxctl/base/output.h"
#include "nrxctl/base/text_line.h"

namespace nrx {

void assertion_failed(std::string_view function, std::string_view expression,
                      source_location location) {
    text_line report;
    report.text(location.file).text(":").number(location.line).text(": ").text(function);
    report.text(": Assertion `").text(expression).text("' failed.\n");
    write_error(report.view());
    std::abort();
}

}  // namespace nrx

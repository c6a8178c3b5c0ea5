#include "nrxctl/base/refuse_word.h"

#include "nrxctl/base/end_process.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/text_line.h"

namespace nrx {

void refuse_word(std::string_view message, std::string_view word) {
    write_output(text_line().text(message).text(" (").text(word).text(")\n").view());
    end_process();
}

}  // namespace nrx

#include "nrxctl/base/refuse_word.h"

#include "nrxctl/base/end_process.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/text_line.h"

namespace nrx {

void refuse_word(std::string_view message, std::string_view word) {
    print_line(text_line().text(message).text(" (").text(word).text(")").view());
    end_process();
}

}  // namespace nrx

#include "support/CommandWord.h"

#include "forms/ControllerForm.h"
#include "support/Text.h"

namespace zel {

bool testCommandWord(ControllerForm& panel, const char* word) {
    panel.STAT = upperCase(panel.CommandLine).find(word) != std::string::npos;
    return panel.STAT;
}

}  // namespace zel

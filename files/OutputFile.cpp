#include "files/OutputFile.h"

#include <string>
#include <utility>

#include "platform/Files.h"
#include "support/FileText.h"

namespace zel {

std::string OutputFile::close() {
    const std::string text = std::exchange(text_, {});
    const FileProblem why =
        mode_ == Mode::Append ? files_.append(path_, text) : files_.replace(path_, text);
    return why.empty() ? std::string() : writeProblem(path_, why);
}

}  // namespace zel

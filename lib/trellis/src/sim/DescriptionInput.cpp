#include "sim/DescriptionInput.h"

#include <algorithm>
#include <istream>
#include <vector>

#include "host/StoredText.h"
#include "util/UserFile.h"

namespace Trellis {
namespace Sim {

namespace {

constexpr std::size_t kChunkBytes = 64 * 1024;

[[noreturn]] void Refuse(const std::string& what, const std::string& problem) {
    throw UnreadableInput("cannot read " + what + ": " + problem);
}

std::string ReadFile(const std::string& file, std::size_t limit) {
    try {
        return Util::ReadUserFile(file, limit);
    } catch (const Util::UnreadableFile& e) {
        Refuse(Host::Printable(file), e.what());
    }
}

std::string ReadStream(std::istream& in, std::size_t limit) {
    std::string text;
    std::vector<char> chunk(kChunkBytes);
    while (in) {
        in.read(chunk.data(), static_cast<std::streamsize>(std::min(chunk.size(), limit + 1 - text.size())));
        text.append(chunk.data(), static_cast<std::size_t>(in.gcount()));
        if (text.size() > limit) Refuse("standard input", Util::TooLargeReason(limit));
    }
    if (in.bad()) Refuse("standard input", "reading it failed");
    return text;
}

}  // namespace

std::string ReadDescriptionInput(const std::string& file, std::istream& in, std::size_t limit) {
    return file == "-" ? ReadStream(in, limit) : ReadFile(file, limit);
}

}  // namespace Sim
}  // namespace Trellis

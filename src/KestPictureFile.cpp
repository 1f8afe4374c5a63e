#include "KestPictureFile.h"

#include "KestFiles.h"

#include <algorithm>
#include <fstream>

namespace {

const char signature[] = "\x89PNG\r\n\x1a\n";
const size_t signatureLength = sizeof(signature) - 1;
/// The name of the last chunk, which is empty, and its checksum.
const char closing[] = "IEND\xae\x42\x60\x82";
/// Some programs append words of their own.
const size_t longestTail = 4096;

}  // namespace

bool KestPictureFile::isWhole(const std::string& path) {
    size_t size = 0;
    if (!KestFiles::sizeOf(path, size) || size < signatureLength) {
        return true;
    }
    std::ifstream file(path, std::ios::binary);
    std::string text(signatureLength, '\0');
    if (!file.read(&text[0], static_cast<std::streamsize>(text.size())) || text != signature) {
        return true;
    }
    text.resize(std::min(size, longestTail));
    file.seekg(-static_cast<std::streamoff>(text.size()), std::ios::end);
    file.read(&text[0], static_cast<std::streamsize>(text.size()));
    return text.find(closing) != std::string::npos;
}

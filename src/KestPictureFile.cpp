#include "KestPictureFile.h"

#include "KestFiles.h"

#include <array>
#include <cstdint>
#include <fstream>

namespace {

const char signature[] = "\x89PNG\r\n\x1a\n";
const size_t signatureLength = sizeof(signature) - 1;
const char lastChunk[] = "IEND";
/// The length of a chunk's contents and its name stand before them, four bytes each, and a checksum after them.
const size_t headLength = 8;
const size_t checksumLength = 4;
/// Far more than a picture that is small enough to be shown is cut into.
const int mostChunks = 65536;

bool hasSignature(std::ifstream& file) {
    std::array<char, signatureLength> bytes{};
    return file.read(bytes.data(), bytes.size()) && std::string(bytes.data(), bytes.size()) == signature;
}

std::uint64_t lengthIn(const std::array<char, headLength>& head) {
    std::uint64_t length = 0;
    for (size_t i = 0; i < 4; ++i) {
        length = length << 8 | static_cast<unsigned char>(head[i]);
    }
    return length;
}

/// Whether the chunks go on to the last one within the file. Some programs append bytes of their own to that.
bool reachesLastChunk(std::ifstream& file, std::uint64_t size) {
    std::uint64_t position = signatureLength;
    for (int chunk = 0; chunk < mostChunks; ++chunk) {
        std::array<char, headLength> head{};
        if (!file.seekg(static_cast<std::streamoff>(position)) || !file.read(head.data(), head.size())) {
            return false;
        }
        position += headLength + lengthIn(head) + checksumLength;
        if (position > size) {
            return false;
        }
        if (std::string(&head[4], 4) == lastChunk) {
            return true;
        }
    }
    return false;
}

}  // namespace

bool KestPictureFile::isWhole(const std::string& path) {
    size_t size = 0;
    if (!KestFiles::sizeOf(path, size)) {
        return true;
    }
    std::ifstream file(path, std::ios::binary);
    return !hasSignature(file) || reachesLastChunk(file, size);
}

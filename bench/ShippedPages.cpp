#include "ShippedPages.h"

#include "KestCommon.h"
#include "KestContentMgr.h"
#include "KestPaths.h"
#include "KestPicturePaths.h"
#include "KestTipMarkup.h"

#include <device/Device.h>
#include <device/Keys.h>

#include <fstream>
#include <memory>
#include <stdexcept>

namespace bench {
namespace {

Picture pictureOf(const std::string& file) {
    const std::string marker = KestPicturePaths::touch(file);
    return {file, KestPicturePaths::isAccessible(marker) ? marker : ""};
}

std::vector<Picture> picturesOf(const std::string& first) {
    if (!KestPicturePaths::isAccessible(first)) {
        return {{KestCommon::getSharedResourcePath(KEST_APP_ID) + "contents/contents_not_released.png", ""}};
    }
    std::vector<Picture> pictures = {pictureOf(first)};
    for (std::string path = KestPicturePaths::second(first); KestPicturePaths::isAccessible(path);
         path = KestPicturePaths::next(path)) {
        pictures.push_back(pictureOf(path));
    }
    return pictures;
}

/// The height that a PNG file says in its header.
int heightOf(const std::string& file) {
    constexpr int heightOffset = 20;
    unsigned char bytes[4] = {};
    std::ifstream stream(file, std::ios::binary);
    if (!stream.seekg(heightOffset) || !stream.read(reinterpret_cast<char*>(bytes), sizeof bytes)) {
        throw std::runtime_error(file + ": not a picture");
    }
    return bytes[0] << 24 | bytes[1] << 16 | bytes[2] << 8 | bytes[3];
}

Page pageOf(const KestContentInfo& record) {
    Page page;
    page.icon = record.iconPath;
    page.title = record.menuTitle;
    page.text = KestTipMarkup::text(record);
    page.pictures = picturesOf(record.imagePath);
    page.height = heightOf(page.pictures.front().file);
    return page;
}

}  // namespace

std::vector<Page> shippedPages() {
    device::Device::setCurrent(std::make_unique<device::Device>(device::Device::Options::standard()));
    device::Device::current().setApplication({KEST_APP_ID, KEST_APP_ROOT});
    // Its region has tips with pictures of every kind.
    device::Device::current().settings().set(device::keys::country, "IN");
    if (!KestContentMgr::getInstance()->loadContentsList(true)) {
        throw std::runtime_error("the catalogue did not load");
    }
    std::vector<Page> pages;
    for (const KestContentInfo& record : KestContentMgr::getInstance()->getContentsList()) {
        pages.push_back(pageOf(record));
    }
    device::Device::current().preferences().finish();
    device::Device::setCurrent(nullptr);
    return pages;
}

}  // namespace bench

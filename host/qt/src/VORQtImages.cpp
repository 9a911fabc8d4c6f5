#include "VORQtImages.h"

#include <map>
#include <utility>

#include "VORPixelImage.h"

namespace VORQtImages {

namespace {
struct Entry {
  VORPixelImage_var image;  // held so that the key is not reused by another image
  QImage converted;
  // What the conversion depended on: an image converted or made transparent in place since is
  // converted again.
  int format;
  int transparency;
  int width;
  int height;
  bool Matches(const VORPixelImage& i) const {
    return format == i.GetFormat() && transparency == i.GetTransparency() &&
           width == i.GetWidth() && height == i.GetHeight();
  }
};
// Keyed by image identity and alpha mode.
std::map<std::pair<const VORPixelImage*, bool>, Entry>& Cache() {
  static std::map<std::pair<const VORPixelImage*, bool>, Entry> cache;
  return cache;
}
constexpr size_t kMaxEntries = 512;
}  // namespace

QImage Convert(const VORPixelImage& image, bool alphaMode) {
  const int w = image.GetWidth();
  const int h = image.GetHeight();
  const int channels = image.GetChannels();
  const auto& pixels = image.GetPixels();
  if (w <= 0 || h <= 0 || channels <= 0 ||
      pixels.size() < static_cast<size_t>(w) * static_cast<size_t>(h) * channels)
    return QImage();
  QImage::Format format = QImage::Format_RGB888;
  if (channels == 1)
    format = QImage::Format_Grayscale8;
  else if (channels == 4)
    format = QImage::Format_RGBA8888;
  else if (channels != 3)
    return QImage();
  // The wrapping QImage does not own the pixels: copy before they can go away.
  QImage wrapped(pixels.data(), w, h, w * channels, format);
  QImage out = wrapped.copy();
  if (channels == 4 && !alphaMode)
    out = out.convertToFormat(QImage::Format_RGB888);
  else if (channels != 4 && alphaMode && image.GetTransparency() > 0) {
    out = out.convertToFormat(QImage::Format_RGBA8888);
    const int alpha = 255 - image.GetTransparency();
    for (int y = 0; y < h; ++y) {
      uchar* line = out.scanLine(y);
      for (int x = 0; x < w; ++x)
        line[4 * x + 3] = static_cast<uchar>(alpha);
    }
  }
  return out;
}

const QImage& ToQImage(const VORPixelImage* image, bool alphaMode) {
  static const QImage none;
  if (image == nullptr)
    return none;
  auto& cache = Cache();
  const auto key = std::make_pair(image, alphaMode);
  auto it = cache.find(key);
  if (it != cache.end()) {
    if (it->second.Matches(*image))
      return it->second.converted;
    cache.erase(it);
  }
  if (cache.size() >= kMaxEntries)
    cache.clear();
  Entry entry{VORPixelImage_var(const_cast<VORPixelImage*>(image)),
              Convert(*image, alphaMode),
              image->GetFormat(),
              image->GetTransparency(),
              image->GetWidth(),
              image->GetHeight()};
  return cache.emplace(key, std::move(entry)).first->second.converted;
}

void ClearCache() {
  Cache().clear();
}

}  // namespace VORQtImages

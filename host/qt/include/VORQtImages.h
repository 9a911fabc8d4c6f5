// Pixel images of the scene as QImages, converted once and kept while the image lives.
#pragma once

#include <QImage>

class VORPixelImage;

namespace VORQtImages {
// The image as a QImage: grey, RGB or RGBA as stored; with alphaMode false an RGBA image is drawn
// opaque. A null QImage for a null or empty image. The reference stays valid until the next call
// that converts a new image.
const QImage& ToQImage(const VORPixelImage* image, bool alphaMode);
// A QImage of the pixels (a copy), with the same rules.
QImage Convert(const VORPixelImage& image, bool alphaMode);
// Forgets every converted image.
void ClearCache();
}  // namespace VORQtImages

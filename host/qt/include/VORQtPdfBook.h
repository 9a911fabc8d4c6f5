// A PDF of charts, one per page, painted by the window's routine: an optional contents page
// listing the page titles, then each chart fitted under its title. Written atomically when
// finished. Works without a window (an offscreen application is made for the fonts).
#pragma once

#include <QBuffer>
#include <QByteArray>
#include <QPainter>
#include <QPdfWriter>
#include <memory>
#include <string>
#include <vector>

class VORViewer;

class VORQtPdfBook {
 public:
  // Landscape A4 pages.
  explicit VORQtPdfBook(std::string documentTitle);
  ~VORQtPdfBook();
  VORQtPdfBook(const VORQtPdfBook&) = delete;
  VORQtPdfBook& operator=(const VORQtPdfBook&) = delete;

  // The first page: "Contents" and one line per title with the page it is on (the charts are
  // expected in that order right after).
  void AddContents(const std::vector<std::string>& titles);
  // A page with title at the top and the viewer's whole scene fitted below it.
  void AddChart(const std::string& title, VORViewer& viewer);
  int PageCount() const { return _pages; }
  // Ends the document and writes it to path; false with a reason in error.
  bool Finish(const std::string& path, std::string& error);

  // One chart in a one-page PDF (File > Export).
  static bool WriteChart(VORViewer& viewer, const std::string& title, const std::string& path,
                         std::string& error);

 private:
  void NewPage();
  QRectF DrawTitle(const QString& title, double pointSize);

  QByteArray _bytes;
  QBuffer _buffer;
  std::unique_ptr<QPdfWriter> _writer;
  std::unique_ptr<QPainter> _painter;
  int _pages = 0;
};

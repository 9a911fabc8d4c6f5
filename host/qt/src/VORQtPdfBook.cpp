#include "VORQtPdfBook.h"

#include <QPageLayout>
#include <QPageSize>

#include "VORFileIO.h"
#include "VORQtImageExport.h"
#include "VORQtScenePainter.h"
#include "VORViewer.h"

namespace {
constexpr int kResolution = 300;           // dots per inch of the page's coordinates
constexpr double kTitlePoints = 14.0;      // page title
constexpr double kContentsPoints = 11.0;   // lines of the contents page
constexpr double kChartMarginDots = 30.0;  // between the title and the chart, and around it
}  // namespace

VORQtPdfBook::VORQtPdfBook(std::string documentTitle) : _buffer(&_bytes) {
  VORQtImageExport::EnsureGuiApplication();
  _buffer.open(QIODevice::WriteOnly);
  _writer = std::make_unique<QPdfWriter>(&_buffer);
  _writer->setResolution(kResolution);
  _writer->setPageLayout(QPageLayout(QPageSize(QPageSize::A4), QPageLayout::Landscape,
                                     QMarginsF(12, 12, 12, 12), QPageLayout::Millimeter));
  _writer->setTitle(QString::fromStdString(documentTitle));
  _writer->setCreator(QStringLiteral("pfv"));
}

VORQtPdfBook::~VORQtPdfBook() {
  if (_painter && _painter->isActive())
    _painter->end();
}

void VORQtPdfBook::NewPage() {
  if (!_painter) {
    _painter = std::make_unique<QPainter>(_writer.get());
  } else {
    _writer->newPage();
  }
  ++_pages;
}

QRectF VORQtPdfBook::DrawTitle(const QString& title, double pointSize) {
  QFont font = _painter->font();
  font.setPointSizeF(pointSize);
  font.setBold(true);
  _painter->setFont(font);
  _painter->setPen(Qt::black);
  const QRectF page(0, 0, _writer->width(), _writer->height());
  const QRectF used = _painter->boundingRect(page, Qt::AlignLeft | Qt::AlignTop, title);
  _painter->drawText(page, Qt::AlignLeft | Qt::AlignTop, title);
  return QRectF(0, used.bottom() + kChartMarginDots, page.width(),
                page.height() - used.bottom() - kChartMarginDots);
}

void VORQtPdfBook::AddContents(const std::vector<std::string>& titles) {
  NewPage();
  QRectF area = DrawTitle(QObject::tr("Contents"), kTitlePoints);
  QFont font = _painter->font();
  font.setPointSizeF(kContentsPoints);
  font.setBold(false);
  _painter->setFont(font);
  const double line = _painter->fontMetrics().lineSpacing();
  double y = area.top();
  int page = _pages;
  for (const std::string& title : titles) {
    if (y + line > area.bottom())
      break;  // a contents page holds what fits; the charts follow in the same order anyway
    const QRectF row(area.left(), y, area.width(), line);
    _painter->drawText(row, Qt::AlignLeft | Qt::AlignVCenter, QString::fromStdString(title));
    _painter->drawText(row, Qt::AlignRight | Qt::AlignVCenter, QString::number(++page));
    y += line;
  }
}

void VORQtPdfBook::AddChart(const std::string& title, VORViewer& viewer) {
  NewPage();
  const QRectF area = DrawTitle(QString::fromStdString(title), kTitlePoints)
                          .adjusted(kChartMarginDots, 0, -kChartMarginDots, -kChartMarginDots);
  const VORRenderList& list = viewer.GetRenderList();
  VORBox2D box = list.GetBoundingBox();
  if (box.IsEmpty())
    return;
  VORQtViewTransform view =
      VORQtViewTransform::Fitting(box, area.width(), area.height(), kChartMarginDots);
  _painter->save();
  _painter->translate(area.topLeft());
  _painter->setClipRect(QRectF(0, 0, area.width(), area.height()));
  _painter->setRenderHint(QPainter::Antialiasing, true);
  VORQtScenePainter scene;
  scene.Paint(*_painter, list, view, QRectF(0, 0, area.width(), area.height()));
  _painter->restore();
}

bool VORQtPdfBook::Finish(const std::string& path, std::string& error) {
  if (!_painter)
    NewPage();  // an empty document still has one page
  if (!_painter->end()) {
    error = path + ": the PDF cannot be made";
    return false;
  }
  _writer.reset();
  _buffer.close();
  return VORWriteFileAtomically(path, _bytes.toStdString(), error, false);
}

bool VORQtPdfBook::WriteChart(VORViewer& viewer, const std::string& title, const std::string& path,
                              std::string& error) {
  VORQtPdfBook book(title);
  book.AddChart(title, viewer);
  return book.Finish(path, error);
}

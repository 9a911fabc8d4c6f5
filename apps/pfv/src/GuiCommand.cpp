// "pfv [document]" and "pfv gui": the application window (on the bundled sample line when no
// document is given); "--has-gui" only answers whether a window can be opened. Also holds the
// PNG and PDF chart writers of "pfv export" (PfvRegisterQtWriters). Built only with the Qt shell.

#include <QImage>
#include <QTimer>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <iostream>
#include <string>
#include <vector>

#include "PfvCommand.h"
#include "PfvImageWriters.h"
#include "VOREnv.h"
#include "VORQtApplication.h"
#include "VORQtImageExport.h"
#include "VORQtMainWindow.h"
#include "VORQtPdfBook.h"
#include "VORQtStrings.h"
#include "VORQtViewerWidget.h"
#include "VORScript.h"

namespace {

constexpr const char* kSample = "underbody.pprx";

// The bundled sample: $PFV_EXAMPLES, else an "examples" folder beside a resource folder of
// VORStartupPath.
std::string FindSample() {
  namespace fs = std::filesystem;
  std::error_code ec;
  if (const char* dir = VORGetEnv("PFV_EXAMPLES")) {
    const fs::path p = fs::path(dir) / kSample;
    if (fs::is_regular_file(p, ec))
      return p.string();
  }
  const char* startup = VORGetEnv("VORStartupPath");
  std::string rest = startup ? startup : "";
  while (!rest.empty()) {
    const size_t colon = rest.find(':');
    const std::string dir = rest.substr(0, colon);
    rest = colon == std::string::npos ? std::string() : rest.substr(colon + 1);
    if (dir.empty())
      continue;
    const fs::path p = fs::path(dir).parent_path() / "examples" / kSample;
    if (fs::is_regular_file(p, ec))
      return p.string();
    const fs::path q = fs::path(dir) / ".." / "examples" / kSample;
    if (fs::is_regular_file(q, ec))
      return fs::weakly_canonical(q, ec).string();
  }
  return std::string();
}

int Usage() {
  std::cerr << "usage: pfv [gui] [document.pprx] [--script FILE] [--screenshot FILE.png "
               "[--zoom F]]\n"
               "       pfv --has-gui\n";
  return 2;
}

int RunGui(const std::vector<std::string>& args) {
  std::string document;
  std::string script;
  std::string screenshot;
  double zoom = 1.0;
  bool hasGui = false;
  for (size_t i = 0; i < args.size(); ++i) {
    const std::string& a = args[i];
    if (a == "--has-gui") {
      hasGui = true;
    } else if ((a == "--script" || a == "--screenshot") && i + 1 < args.size()) {
      (a == "--script" ? script : screenshot) = args[++i];
    } else if (a == "--zoom" && i + 1 < args.size()) {
      zoom = std::atof(args[++i].c_str());
      if (!(zoom > 0.0))
        return Usage();
    } else if (!a.empty() && a[0] == '-') {
      std::cerr << "pfv: unknown option " << a << "\n";
      return Usage();
    } else if (document.empty()) {
      document = a;
    } else {
      return Usage();
    }
  }
  if (hasGui)
    return VORQtCanOpenDisplay() ? 0 : 1;
  if (!VORQtCanOpenDisplay()) {
    std::cerr << "pfv: no window can be opened here (no display). \"pfv export\" writes a "
                 "chart without one.\n";
    return 1;
  }
  if (document.empty()) {
    document = FindSample();
    if (document.empty())
      std::cerr << "pfv: the sample " << kSample << " was not found; starting empty.\n";
  }

  int argc = 1;
  char name[] = "pfv";
  char* argv[] = {name, nullptr};
  VORQtApplication app(argc, argv);
  VORQtMainWindow window;
  window.show();
  if (!document.empty())
    window.OpenDocument(VORQtString(document));
  int status = 0;
  if (!script.empty()) {
    VORScript runner(window.Driver(), std::cout);
    if (!runner.RunFile(script))
      status = 1;
    app.AfterEvent();
  }
  if (screenshot.empty())
    return app.exec() == 0 ? status : 1;
  // Let the window settle (layout, first paint), then take its picture and leave.
  QTimer::singleShot(800, &window, [&]() {
    app.AfterEvent();
    // Closer than "fit all", about the start of the chart: labels readable in the picture.
    if (VORQtViewerWidget* chart = window.CurrentViewerWidget(); chart != nullptr && zoom != 1.0) {
      chart->GetViewer()->GetMain2DViewpoint()->Zoom(zoom, chart->width() * 0.02,
                                                     chart->height() * 0.5);
      chart->Sync();
    }
    const QImage image = window.grab().toImage();
    if (image.isNull() || !image.save(VORQtString(screenshot), "PNG")) {
      std::cerr << "pfv: cannot write " << screenshot << "\n";
      status = 1;
    }
    app.quit();
  });
  app.exec();
  return status;
}

bool WritePNG(VORViewer& viewer, const std::string& path, std::string& error) {
  return VORQtImageExport::WritePNG(viewer, path, error);
}

}  // namespace

PFV_COMMAND(gui, "gui", "[document.pprx] [--script FILE] [--screenshot FILE.png] | --has-gui",
            "open the window (also without a sub-command); --has-gui tells whether one can open",
            RunGui);

namespace {
class PdfBook : public PfvBookWriter {
 public:
  explicit PdfBook(const std::string& title) : _book(title) {}
  void AddContents(const std::vector<std::string>& titles) override { _book.AddContents(titles); }
  void AddChart(const std::string& title, VORViewer& viewer) override {
    _book.AddChart(title, viewer);
  }
  bool Finish(const std::string& path, std::string& error) override {
    return _book.Finish(path, error);
  }

 private:
  VORQtPdfBook _book;
};
bool WritePDF(VORViewer& viewer, const std::string& path, std::string& error) {
  return VORQtPdfBook::WriteChart(viewer, std::filesystem::path(path).stem().string(), path, error);
}

}  // namespace

void PfvRegisterQtWriters() {
  PfvRegisterImageWriter("png", WritePNG);
  PfvRegisterImageWriter("pdf", WritePDF);
  PfvRegisterBookWriter("pdf", [](const std::string& title) -> std::unique_ptr<PfvBookWriter> {
    return std::make_unique<PdfBook>(title);
  });
}

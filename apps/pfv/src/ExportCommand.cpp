// pfv export <document> [--activity <name or id>] [--organise] [--out
// chart.svg|chart.png|chart.pdf]: writes the PERT chart of the activity's children (default: the
// root process) as SVG (to standard output without --out); --organise lays it out with the Product
// Flow Viewer's organiser first. --all-levels --out plan.pdf writes every level that has a chart,
// one per page, after a contents page.
#include <cstdio>
#include <filesystem>
#include <string>

#include "PfvChartLevels.h"
#include "PfvCommand.h"
#include "PfvImageWriters.h"
#include "QELPertChart.h"
#include "QELPertViewer.h"
#include "VORDeferredDeletion.h"
#include "VORModel.h"
#include "VORModuleLoader.h"
#include "VORSVGWriter.h"

namespace {

// The activity with that id, else the first one in document order whose label is name.
VORBaseUnknown_var FindActivity(VORProcess* doc, const std::string& key) {
  VORBaseUnknown_var byId(doc->FindObject(key));
  if (byId && VORISPPActivity_var(byId))
    return byId;
  const VORUnicodeString wanted(key);
  std::vector<VORBaseUnknown_var> stack{doc->GetRootProcess()};
  while (!stack.empty()) {
    VORBaseUnknown_var object = stack.back();
    stack.pop_back();
    VORIGENode_var node(object);
    if (!node)
      continue;
    VORUnicodeString label;
    node->GetLabel(label);
    if (label == wanted && VORISPPActivity_var(object))
      return object;
    VORListValVORBaseUnknown_var* children = nullptr;
    if (SUCCEEDED(node->GetChildren(children)) && children != nullptr) {
      for (int i = children->Size(); i >= 1; --i)
        stack.push_back((*children)[i]);
    }
    delete children;
  }
  return VORBaseUnknown_var();
}

// --organise: the default node positions of the Product Flow Viewer, by the organiser of the
// viewer module (loaded by name; positions change in memory only). False when it is missing.
bool Organise(VORBaseUnknown* root, QELPertController* controller) {
  using ArrangeChart = int (*)(VORBaseUnknown*, QELPertController*);
  auto arrange = reinterpret_cast<ArrangeChart>(
      VORModuleLoader::FindSymbol("QELProductFlowViewer", "QELPFVArrangeChart"));
  if (arrange == nullptr) {
    std::fprintf(stderr, "pfv export: --organise needs the viewer module: %s\n",
                 VORModuleLoader::LastError().c_str());
    return false;
  }
  if (arrange(root, controller) == 1)
    std::fprintf(stderr, "pfv export: the flows are cyclic; the stored positions are kept\n");
  return true;
}

QELPertViewer* NewExportViewer() {
  return new QELPertViewer(nullptr, "Export", QELPertParameters::PERT_VIEWER_STYLE, 800, 500,
                           QELPertParameters::PERT_VIEWER_FLAGS);
}

// Every level with children, one page each after a contents page, in the book writer of out's
// extension.
int ExportAllLevels(VORProcess* doc, const std::string& document, const std::string& out,
                    bool organise) {
  const PfvBookWriterFactory* factory = PfvFindBookWriter(out);
  if (factory == nullptr) {
    std::fprintf(stderr, "pfv export: --all-levels writes a PDF (--out plan.pdf)%s\n",
                 PfvFindBookWriter("x.pdf") ? "" : ", which this build cannot write");
    return 1;
  }
  const std::vector<PfvChartLevel> levels = PfvChartLevels(doc);
  std::vector<std::string> titles;
  for (const PfvChartLevel& level : levels)
    titles.push_back(level.path);
  std::unique_ptr<PfvBookWriter> book =
      (*factory)(std::filesystem::path(document).filename().string());
  book->AddContents(titles);
  int page = 1;  // the contents
  for (const PfvChartLevel& level : levels) {
    auto viewer = VORHandle<QELPertViewer>::Adopt(NewExportViewer());
    auto controller =
        VORHandle<QELPertController>::Adopt(QELPertBuildChart(level.activity, viewer));
    if (!controller) {  // its page stays, with the title only, so the contents stay right
      book->AddChart(level.path, *viewer);
      ++page;
      continue;
    }
    if (organise && !Organise(level.activity, controller)) {
      controller->RemoveAllPertNodes();
      return 1;
    }
    book->AddChart(level.path, *viewer);
    std::fprintf(stderr, "pfv export: page %d: %s (%d nodes)\n", ++page, level.path.c_str(),
                 controller->GetNodeCount());
    controller->RemoveAllPertNodes();
    VORDeferredDeletion::Drain();
  }
  std::string error;
  if (!book->Finish(out, error)) {
    std::fprintf(stderr, "pfv export: %s\n", error.c_str());
    return 1;
  }
  std::fprintf(stderr, "pfv export: wrote %s (contents and %zu levels)\n", out.c_str(),
               levels.size());
  return 0;
}

int RunExport(const std::vector<std::string>& args) {
  std::string document;
  std::string activity;
  std::string out;
  bool organise = false;
  bool allLevels = false;
  bool usage = false;
  for (size_t i = 0; i < args.size(); ++i) {
    const std::string& a = args[i];
    if (a == "--activity" && i + 1 < args.size()) {
      activity = args[++i];
    } else if (a == "--out" && i + 1 < args.size()) {
      out = args[++i];
    } else if (a == "--organise") {
      organise = true;
    } else if (a == "--all-levels") {
      allLevels = true;
    } else if (!a.empty() && a[0] != '-' && document.empty()) {
      document = a;
    } else {
      usage = true;
    }
  }
  if (usage || document.empty() || (allLevels && (out.empty() || !activity.empty()))) {
    std::fprintf(stderr,
                 "Usage: pfv export <document.pprx> [--activity <name or id>] [--organise] "
                 "[--out chart.svg|chart.png|chart.pdf]\n"
                 "       pfv export <document.pprx> --all-levels [--organise] --out plan.pdf\n");
    return 2;
  }
  std::string error;
  VORProcess_var doc = VORProcess_var::Adopt(VORProcess::Load(document, error));
  if (!doc) {
    std::fprintf(stderr, "pfv export: %s\n", error.c_str());
    return 1;
  }
  if (allLevels) {
    const int status = ExportAllLevels(doc, document, out, organise);
    VORDeferredDeletion::Drain();
    return status;
  }
  // Without --activity: the root process, the level the Product Flow Viewer opens on first.
  VORBaseUnknown_var root = activity.empty() ? doc->GetRootProcess() : FindActivity(doc, activity);
  if (!root) {
    std::fprintf(stderr, "pfv export: %s: no activity with the id or label \"%s\"\n",
                 document.c_str(), activity.c_str());
    return 1;
  }
  int status = 0;
  {
    auto viewer = VORHandle<QELPertViewer>::Adopt(NewExportViewer());
    auto controller = VORHandle<QELPertController>::Adopt(QELPertBuildChart(root, viewer));
    if (!controller) {
      std::fprintf(stderr, "pfv export: \"%s\" cannot be shown as a chart\n", activity.c_str());
      return 1;
    }
    if (organise && !Organise(root, controller))
      return 1;
    // Other formats than SVG come from the writers the build registers (PNG with the window).
    const PfvImageWriter* writer = out.empty() ? nullptr : PfvFindImageWriter(out);
    const std::string extension = std::filesystem::path(out).extension().string();
    if (out.empty()) {
      const std::string svg = VORSVGWriter::ToString(*viewer);
      std::fwrite(svg.data(), 1, svg.size(), stdout);
    } else if (writer == nullptr && !extension.empty() && extension != ".svg") {
      std::string formats = "svg";
      for (const std::string& e : PfvImageWriterExtensions())
        formats += ", " + e;
      std::fprintf(stderr, "pfv export: %s: unknown picture format (this build writes %s)\n",
                   out.c_str(), formats.c_str());
      status = 1;
    } else if (writer != nullptr ? !(*writer)(*viewer, out, error)
                                 : !VORSVGWriter::WriteFile(*viewer, out, error)) {
      std::fprintf(stderr, "pfv export: %s\n", error.c_str());
      status = 1;
    } else {
      std::fprintf(stderr, "pfv export: wrote %s (%d nodes, %d links)\n", out.c_str(),
                   controller->GetNodeCount(), controller->GetLinkCount());
    }
    controller->RemoveAllPertNodes();
  }
  VORDeferredDeletion::Drain();
  return status;
}

}  // namespace

PFV_COMMAND(export, "export",
            "<document.pprx> [--activity <name or id> | --all-levels] [--organise] "
            "[--out chart.svg|chart.png|chart.pdf]",
            "write the PERT chart of an activity's children as SVG (PNG, PDF); --all-levels: "
            "every level, one PDF page each after a contents page",
            RunExport);

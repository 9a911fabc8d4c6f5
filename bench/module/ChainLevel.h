// The level the module benchmarks work on: stations S0 -> S1 -> ... on one level, on the chart
// grid, saved to a file and opened in the Product Flow Viewer through the headless driver.
#pragma once

#include <string>

#include "VORDocument.h"
#include "VORDriver.h"
#include "VORModelDoor.h"

inline std::string StationLabel(int i) {
  return "S" + std::to_string(i);
}

// The chart position of station i.
inline double StationX(int i) {
  return 12.5 + 50.0 * i;
}

// Saves a chain of n stations to file; dress(door, document, station, i) adds what a
// benchmark needs on each station.
template <typename Dress>
std::string SaveChainLevel(const std::string& file, int n, Dress dress) {
  VORProcess_var doc = VORProcess_var::Adopt(VORProcess::CreateNew("Line"));
  VORModelDoor& door = doc->GetDoor();
  VORBaseUnknown_var root = doc->GetRootProcess();
  VORBaseUnknown_var previous;
  for (int i = 0; i < n; ++i) {
    VORBaseUnknown_var station;
    door.CreateNode(root, "BIWActivityStation", station);
    door.SetLabel(station, VORUnicodeString(StationLabel(i)));
    door.SetPertPosition(station, true, StationX(i), 12.5);
    dress(door, *doc, station, i);
    if (previous)
      door.AddFlow(previous, station);
    previous = station;
  }
  std::string error;
  doc->SaveAs(file, error);
  return file;
}

// Opens file and shows its root level in the viewer; false (with the driver's error) if not.
inline bool OpenInViewer(VORDriver& driver, const std::string& file) {
  return driver.OpenDocument(file) && driver.PickObject("Line") &&
         driver.StartCommand("QELFpaProductFlowViewerCmd");
}

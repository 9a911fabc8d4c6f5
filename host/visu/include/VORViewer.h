// The 2D viewer: holds its own reps and shows the reps of the interactive set of objects it is
// attached to, through its main 2D viewpoint. It turns the GUI's mouse events (pixel
// coordinates) into picking, preselection, manipulator gestures, selection picks, context
// notifications, panning and zooming, so a widget only forwards events and paints the render
// list; headless tests drive the same entry points.
//
// Events on the viewer's publisher: "VORViewerRedraw" on each Draw request, "VORViewerPick"
// (VORViewerPickNotification) on a selection click, and the context notification (class
// VORContext) on a right click.
#pragma once

#include <unordered_map>
#include <vector>

#include "VOR2DRep.h"
#include "VOR2DViewpoint.h"
#include "VORCommand.h"
#include "VORContext.h"
#include "VORISO.h"
#include "VORManipulator.h"
#include "VORPathElement.h"
#include "VORRenderList.h"
#include "VORSelectionSet.h"

class VORPVBalloon;

enum VORMouseButton { VORMouseNone = 0, VORMouseLeft = 1, VORMouseMiddle = 2, VORMouseRight = 3 };
enum VORModifierKey { VORModShift = 1, VORModControl = 2, VORModAlt = 4 };

// Cursor shape codes: the GUI chooses the look, the meaning is fixed here.
enum VORCursorShape {
  VORCursorDefault = 0,
  VORCursorDragging = 5,     // something is dragged, no drop here
  VORCursorDropAllowed = 8,  // a drop here is accepted
  VORCursorSelect = 25,      // plain pointer after a drag ended
};

class VORModelForRep2D;

// A selection click: the picked paths front to back (possibly none: a click on the background).
class VORViewerPickNotification : public VORNotification {
  VOR_DECLARE_CLASS(VORViewerPickNotification, VORNotification)
 public:
  VORViewerPickNotification(std::vector<VORPathElement_var> paths, int modifiers,
                            int multiSelBehavior)
      : _paths(std::move(paths)), _modifiers(modifiers), _multiSel(multiSelBehavior) {}
  const std::vector<VORPathElement_var>& GetPaths() const { return _paths; }
  int GetModifiers() const { return _modifiers; }
  // The viewer's multi-selection behaviour: 1 lets Shift or Control add to the selection.
  int GetMultiSelBehavior() const { return _multiSel; }

 private:
  std::vector<VORPathElement_var> _paths;
  int _modifiers;
  int _multiSel;
};

class VORViewer : public VORCommand {
  VOR_DECLARE_CLASS(VORViewer, VORCommand)
 public:
  static constexpr const char* kRedrawEvent = "VORViewerRedraw";
  static constexpr const char* kPickEvent = "VORViewerPick";
  static constexpr double kPickTolerancePixels = 3.0;
  // Zoom factor of one wheel notch (120 units of delta): a step a planner notices.
  static constexpr double kWheelNotchZoom = 1.25;
  static constexpr double kDragThresholdPixels = 3.0;

  // parent is the dialog that holds the viewer (not held); style and flags are kept for the GUI.
  VORViewer(VORCommand* parent, const VORString& name, int style, int width, int height, int flags);

  int GetStyle() const { return _style; }
  int GetFlags() const { return _flags; }
  VOR2DViewpoint* GetMain2DViewpoint() const { return _viewpoint; }

  // The viewer's own reps, drawn in order below the interactive set's reps.
  void AddRep(VOR2DRep* rep);
  bool RemoveRep(VOR2DRep* rep);
  const std::vector<VOR2DRep_var>& GetReps() const { return _reps; }
  // Shows the reps of the set's VORModelForRep2D elements and follows its changes; the set is
  // held and lists the viewer (AddViewer). A set shows in the viewer exactly while it lists it:
  // an editor's ISO that the viewer was added to (VORISO::AddViewer) is picked up from the
  // current selection context on the next draw or pick, and a set that removed the viewer
  // (RemoveViewer) is dropped then.
  void AttachISO(VORISO* iso);
  void DetachISO(VORISO* iso);
  const std::vector<VORISO_var>& GetAttachedISOs() {
    FollowISOs();
    return _isos;
  }

  // Everything shown, in model coordinates.
  VORBox2D GetSceneBox();
  // Fits the scene into the window.
  void Reframe();
  // Asks the GUI to repaint ("VORViewerRedraw"); the render list follows the scene on demand.
  void Draw();
  int GetDrawRequestCount() const { return _drawRequests; }
  // The flattened scene (rebuilt when any rep, set or highlight changed since the last call).
  const VORRenderList& GetRenderList();

  void GetGraphicSize(float& width, float& height) const;
  void SetGraphicSize(int width, int height);
  void SetBackgroundColor(float r, float g, float b);
  void GetBackgroundColor(float& r, float& g, float& b) const;
  void SetViewerSelectable(bool selectable) { _selectable = selectable; }
  bool IsSelectable() const { return _selectable; }
  // Multi-selection behaviour reported with each pick (1: Shift/Control add to the selection).
  void SetMultiSelBehavior(int behavior) { _multiSel = behavior; }
  int GetMultiSelBehavior() const { return _multiSel; }

  // Highlighted and preselected sets (VORVisManager attaches them); not held.
  void SetHighlightSet(VORSelectionSet* hso);
  void SetPreselectionSet(VORSelectionSet* pso);
  VORSelectionSet* GetHighlightSet() const { return _hso; }
  VORSelectionSet* GetPreselectionSet() const { return _pso; }
  // Drops what is preselected (the reps under the pointer may be going away).
  void ClearPreselection();
  // VORHighlight flags of an object (by identity) in the attached sets' leaves.
  int HighlightOf(VORBaseUnknown* object);

  // Paths of the model objects under the pixel, front to back: a new list of VORPathElement
  // objects that the caller deletes. Hidden reps are skipped; reps standing for no object are
  // not reported; equal paths are reported once.
  VORListValVORBaseUnknown_var* Pick(double px, double py);
  std::vector<VORPathElement_var> PickPaths(double px, double py);
  // The same at a model point (a manipulator's point), with the same pixel tolerance.
  std::vector<VORPathElement_var> PickPathsAtModelPoint(double x, double y);
  // Rep chains under a model point: those under the point itself first, then those within the
  // tolerance, each front to back (the viewer's own reps below the set's).
  std::vector<VORPickHit> PickReps(double x, double y, double tolerance);

  void SetCursor(int shape) { _cursor = shape; }
  int GetCursor() const { return _cursor; }

  // Mouse entry points (pixels, y down). buttons: a VORMouseButton; modifiers: VORModifierKey bits.
  void OnMousePress(double px, double py, int button, int modifiers = 0);
  void OnMouseMove(double px, double py, int modifiers = 0);
  void OnMouseRelease(double px, double py, int button, int modifiers = 0);
  // delta in eighths of a degree as wheels report it (120 per notch); zooms about the pointer.
  void OnMouseWheel(double px, double py, int delta, int modifiers = 0);
  // A context click (right button or the menu key) at the pixel.
  void OnContextMenu(double px, double py, int modifiers = 0);
  void OnMouseLeave();

  // The manipulator of the frontmost rep under the pixel, or null.
  // element (when given) receives the rep the manipulator acts on.
  VORManipulator* ManipulatorAt(double px, double py, VOR2DRep** element = nullptr);
  // Model point under the pointer's last known position.
  const VORMathPoint2D& GetPointerModelPoint() const { return _pointer; }

  const std::vector<VORPVBalloon*>& GetBalloons() const { return _balloons; }

 protected:
  ~VORViewer() override;

 private:
  friend class VORPVBalloon;
  friend class VOR2DViewpoint;
  void ViewChanged() { ++_viewChanges; }
  void SetDirty() { _dirty = true; }
  void FollowISOs();
  // The rep models of each attached set, in the set's order: asked of the set's elements once
  // after each change of the sets, not on every frame or reframe.
  const std::vector<std::vector<VORModelForRep2D*>>& ISOModels();
  std::vector<VORPathElement_var> PathsFromHits(const std::vector<VORPickHit>& hits) const;
  void UpdateHover(double px, double py, int modifiers);
  void SelectionPick(double px, double py, int modifiers);

  int _style;
  int _flags;
  int _width;
  int _height;
  VOR2DViewpoint_var _viewpoint;
  std::vector<VOR2DRep_var> _reps;
  std::vector<VORISO_var> _isos;
  std::vector<std::vector<VORModelForRep2D*>> _isoModels;  // held by the sets
  bool _isoModelsValid = false;
  float _background[3] = {1.0f, 1.0f, 1.0f};
  bool _selectable = false;
  int _multiSel = 0;
  int _cursor = VORCursorDefault;
  int _drawRequests = 0;
  int _viewChanges = 0;

  VORSelectionSet* _hso = nullptr;
  VORSelectionSet* _pso = nullptr;
  VORCallbackId _hsoCallback = 0;
  VORCallbackId _psoCallback = 0;
  std::unordered_map<VORBaseUnknown*, int> _highlights;
  bool _highlightsValid = false;

  VORRenderList _renderList;
  unsigned long _renderGeneration = 0;
  bool _dirty = true;

  // Gesture state.
  VORManipulator_var _hover;
  VORManipulator_var _active;
  int _pressButton = VORMouseNone;
  double _pressX = 0.0;
  double _pressY = 0.0;
  double _lastX = 0.0;
  double _lastY = 0.0;
  bool _moved = false;
  VORMathPoint2D _pointer;

  std::vector<VORPVBalloon*> _balloons;
};
VOR_DECLARE_HANDLE(VORViewer);

// The 2D viewer under the name the graph editor's services use.
using VOR2DViewer = VORViewer;

// The document's document tree (process tree, products, resources) in a dock. Its
// selection shows the editor's CSO and highlight; clicking an object picks it through the
// driver, so it feeds the running command exactly as a pick in a chart does.
#pragma once

#include <QTreeWidget>
#include <string>

#include "VORBaseUnknown.h"

class VORDriver;
class VORProcess;

class VORQtDocumentTree : public QTreeWidget {
  Q_OBJECT
 public:
  // The role of an item's document id (a QString); empty for the three section headers.
  static constexpr int IdRole = Qt::UserRole + 1;

  VORQtDocumentTree(VORDriver& driver, QWidget* parent = nullptr);

  // Rebuilds the tree from document (null: empty), keeping the expanded branches.
  void Rebuild(VORProcess* document);
  // Selects the CSO's objects and shows the highlighted ones in bold.
  void ShowSelection();
  // The item of an object id, or null.
  QTreeWidgetItem* ItemOf(const QString& id) const;

 signals:
  // After a pick made through the tree (the caller refreshes what depends on it).
  void picked();

 private:
  void AddNode(QTreeWidgetItem* parent, VORBaseUnknown* node, int depth);
  void AddProduct(QTreeWidgetItem* parent, VORBaseUnknown* product, int depth);
  void OnClicked(QTreeWidgetItem* item);

  VORDriver& _driver;
  bool _updating = false;
};

#include "VORQtDocumentTree.h"

#include <QSet>
#include <memory>

#include "VORDocument.h"
#include "VORDriver.h"
#include "VORFrmWindowKinds.h"
#include "VORIGENode.h"
#include "VORIProduct.h"
#include "VORISpecObject.h"
#include "VORQtStrings.h"

namespace {
constexpr int kMaxDepth = 200;

QString IdOf(VORBaseUnknown* object) {
  VORISpecObject_var spec{VORBaseUnknown_var(object)};
  return spec ? VORQtString(spec->GetId()) : QString();
}

QSet<QString> LeafIds(VORSelectionSet* set) {
  QSet<QString> ids;
  if (set == nullptr)
    return ids;
  for (int i = 1; i <= set->GetSize(); ++i) {
    VORPathElement* path = set->GetElement(i);
    if (path != nullptr && path->GetLeaf() != nullptr)
      ids.insert(IdOf(path->GetLeaf()));
  }
  return ids;
}
}  // namespace

VORQtDocumentTree::VORQtDocumentTree(VORDriver& driver, QWidget* parent)
    : QTreeWidget(parent), _driver(driver) {
  setObjectName(QStringLiteral("DocumentTree"));
  setHeaderHidden(true);
  setSelectionMode(QAbstractItemView::ExtendedSelection);
  connect(this, &QTreeWidget::itemClicked, this,
          [this](QTreeWidgetItem* item, int) { OnClicked(item); });
  connect(this, &QTreeWidget::itemActivated, this,
          [this](QTreeWidgetItem* item, int) { OnClicked(item); });
}

void VORQtDocumentTree::AddNode(QTreeWidgetItem* parent, VORBaseUnknown* node, int depth) {
  auto* item = new QTreeWidgetItem(parent, QStringList(VORQtString(VORFrmObjectLabel(node))));
  item->setData(0, IdRole, IdOf(node));
  VORIGENode_var gen{VORBaseUnknown_var(node)};
  VORListValVORBaseUnknown_var* children = nullptr;
  if (depth >= kMaxDepth || !gen || FAILED(gen->GetChildren(children)) || children == nullptr)
    return;
  std::unique_ptr<VORListValVORBaseUnknown_var> owned(children);
  for (const VORBaseUnknown_var& child : *children)
    AddNode(item, child, depth + 1);
}

void VORQtDocumentTree::AddProduct(QTreeWidgetItem* parent, VORBaseUnknown* product, int depth) {
  auto* item = new QTreeWidgetItem(parent, QStringList(VORQtString(VORFrmObjectLabel(product))));
  item->setData(0, IdRole, IdOf(product));
  VORIProduct_var p{VORBaseUnknown_var(product)};
  VORListValVORBaseUnknown_var* children = nullptr;
  if (depth >= kMaxDepth || !p || FAILED(p->GetChildren(children, "VORIProduct")) ||
      children == nullptr)
    return;
  std::unique_ptr<VORListValVORBaseUnknown_var> owned(children);
  for (const VORBaseUnknown_var& child : *children)
    AddProduct(item, child, depth + 1);
}

void VORQtDocumentTree::Rebuild(VORProcess* document) {
  QSet<QString> expanded;
  for (QTreeWidgetItemIterator it(this); *it; ++it) {
    if ((*it)->isExpanded())
      expanded.insert((*it)->data(0, IdRole).toString() + "|" + (*it)->text(0));
  }
  const bool first = topLevelItemCount() == 0;
  _updating = true;
  clear();
  if (document != nullptr) {
    auto section = [this](const QString& title) {
      auto* item = new QTreeWidgetItem(this, QStringList(title));
      item->setFlags(item->flags() & ~Qt::ItemIsSelectable);
      QFont font = item->font(0);
      font.setItalic(true);
      item->setFont(0, font);
      return item;
    };
    QTreeWidgetItem* process = section(tr("Process"));
    AddNode(process, document->GetRootProcess(), 0);
    QTreeWidgetItem* products = section(tr("Products"));
    AddProduct(products, document->GetRootProduct(), 0);
    QTreeWidgetItem* resources = section(tr("Resources"));
    AddProduct(resources, document->GetResourceRoot(), 0);
    for (QTreeWidgetItemIterator it(this); *it; ++it) {
      const QString key = (*it)->data(0, IdRole).toString() + "|" + (*it)->text(0);
      // A new document opens on its sections and their first level.
      if (expanded.contains(key) ||
          (first && ((*it)->parent() == nullptr || (*it)->parent()->parent() == nullptr)))
        (*it)->setExpanded(true);
    }
  }
  _updating = false;
  ShowSelection();
}

QTreeWidgetItem* VORQtDocumentTree::ItemOf(const QString& id) const {
  if (id.isEmpty())
    return nullptr;
  for (QTreeWidgetItemIterator it(const_cast<VORQtDocumentTree*>(this)); *it; ++it) {
    if ((*it)->data(0, IdRole).toString() == id)
      return *it;
  }
  return nullptr;
}

void VORQtDocumentTree::ShowSelection() {
  VORFrmEditor* editor = _driver.GetEditor();
  const QSet<QString> selected = LeafIds(editor ? editor->GetCSO() : nullptr);
  const QSet<QString> highlighted = LeafIds(editor ? editor->GetHSO() : nullptr);
  _updating = true;
  const QSignalBlocker block(this);
  for (QTreeWidgetItemIterator it(this); *it; ++it) {
    const QString id = (*it)->data(0, IdRole).toString();
    if (id.isEmpty())
      continue;
    (*it)->setSelected(selected.contains(id));
    QFont font = (*it)->font(0);
    if (font.bold() != highlighted.contains(id)) {
      font.setBold(highlighted.contains(id));
      (*it)->setFont(0, font);
    }
  }
  _updating = false;
}

void VORQtDocumentTree::OnClicked(QTreeWidgetItem* item) {
  if (_updating || item == nullptr)
    return;
  const QString id = item->data(0, IdRole).toString();
  if (id.isEmpty())
    return;
  _driver.PickObject(id.toStdString());
  ShowSelection();
  emit picked();
}

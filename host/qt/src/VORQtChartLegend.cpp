#include "VORQtChartLegend.h"

#include <QColor>

#include "QELPertActivityColors.h"
#include "VORGraphicAttribute.h"

VORQtChartLegend::VORQtChartLegend(QWidget* chart) : QLabel(chart) {
  setObjectName(QStringLiteral("ChartLegend"));
  QString html = QStringLiteral("<table cellspacing='2'>");
  for (const QELPertActivityKind& kind : QELPertActivityColors::Legend()) {
    const VORColorRGB rgb = VORColorFromIndex(kind.colorIndex);
    html += QStringLiteral(
                "<tr><td style='background-color:%1; border:1px solid #555'>&nbsp;&nbsp;&nbsp;"
                "</td><td>%2</td></tr>")
                .arg(QColor(rgb.r, rgb.g, rgb.b).name(), QString::fromLatin1(kind.name));
  }
  setText(html + QStringLiteral("</table>"));
  setStyleSheet(QStringLiteral(
      "QLabel#ChartLegend { background: rgba(255,255,255,220); border: 1px solid #aaa;"
      " padding: 3px; }"));
  setAttribute(Qt::WA_TransparentForMouseEvents);
  adjustSize();
  move(8, 8);
  show();
}

// The small legend in a chart's corner: one coloured square per kind of activity, in the
// colours the chart fills its nodes with.
#pragma once

#include <QLabel>

class VORQtChartLegend : public QLabel {
  Q_OBJECT
 public:
  // A child of chart, kept in its top-left corner.
  explicit VORQtChartLegend(QWidget* chart);
};

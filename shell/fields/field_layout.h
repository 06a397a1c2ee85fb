#pragma once

#include <QLayout>
#include <QPointer>
#include <vector>

namespace gridbay::shell {

// The inside of a page or frame: rows of fields whose labels stand in columns, and rows of blocks (frames and
// tables) side by side. Short fields keep their width; what may grow shares the width that is left. A row of
// blocks is as high as they ask for, and where there is less room the highest give way first.
class FieldLayout final : public QLayout {
  Q_OBJECT
 public:
  explicit FieldLayout(QWidget* parent);
  ~FieldLayout() override;

  enum class Kind {
    labelled,  // its input stands in a column behind the labels, also without one of its own
    free,      // a check box or button: begins where the row does, or behind what is before it
    block,
  };
  // A control in a row of its own, or in the row of the one before it. Label and unit may be null.
  void addField(Kind kind, QWidget* label, QWidget* input, QWidget* unit, bool beside);
  // A line below the row of an input, where that begins.
  void addMessage(const QWidget* input, QWidget* message);

  QSize sizeHint() const override;
  QSize minimumSize() const override;
  Qt::Orientations expandingDirections() const override;
  void setGeometry(const QRect& rect) override;
  void invalidate() override;
  int count() const override { return static_cast<int>(items_.size()); }
  QLayoutItem* itemAt(int index) const override;
  QLayoutItem* takeAt(int index) override;
  // Items are added as fields.
  void addItem(QLayoutItem* item) override;

 private:
  struct Cell {
    Kind kind;
    QLayoutItem* label;
    QLayoutItem* input;
    QLayoutItem* unit;
    std::vector<QLayoutItem*> messages;
  };
  using Row = std::vector<Cell>;
  struct Extent {
    int least = 0;
    int wanted = 0;
    int most = 0;
  };
  // What the rows need, measured once for each change.
  struct Measures {
    std::vector<int> columns;      // where the n-th cell of a row begins
    std::vector<int> labelWidths;  // of the n-th cell
    std::vector<Extent> heights;   // of the rows
    Extent width;
    bool expands = false;
  };

  QLayoutItem* add(QWidget* widget);
  const Measures& measures() const;
  static bool isShown(const Cell& cell);
  static bool isBlockRow(const Row& row);
  bool isAligned(const Row& row, std::size_t cell) const;
  static bool stretches(const Cell& cell);
  // The width of a cell with its label, given the room that labels have there.
  static Extent widthOf(const Cell& cell, int labelWidth);
  static Extent heightOf(const Row& row);
  int gapBefore(std::size_t row) const;
  void placeFields(const Row& row, QRect room) const;
  void placeBlocks(const Row& row, QRect room) const;
  static void placeCell(const Cell& cell, const QRect& room, const QRect& bounds, int labelWidth,
                        int lineHeight);
  // Shares room among extents: what is missing is taken from the largest, what is left goes to who can grow.
  static std::vector<int> shared(const std::vector<Extent>& extents, int room);

  std::vector<QLayoutItem*> items_;
  std::vector<Row> rows_;
  mutable Measures measures_;
  mutable bool isMeasured_ = false;
};

}  // namespace gridbay::shell

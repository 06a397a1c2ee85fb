#pragma once

#include <QPainter>
#include <QString>
#include <functional>
#include <memory>
#include <vector>

#include "map/map_editor.h"
#include "shell/map/map_frame.h"

namespace gridbay::shell {

// What the user holds with the mouse: it follows the pointer, shows what would come of it, and makes one
// edit of it at the end. What is dropped has changed nothing.
class MapGrasp {
 public:
  virtual ~MapGrasp() = default;

  virtual void moveTo(MapPoint place) = 0;
  // A click at a place; true when nothing more is needed.
  virtual bool click(MapPoint place) {
    moveTo(place);
    return true;
  }
  // The end that the user asks for, by a double click or Return; true when there is enough.
  virtual bool finish() { return true; }
  // Takes the last click back; false when there is none left.
  virtual bool stepBack() { return false; }
  // The clicks that have been made and count.
  virtual std::size_t clicks() const { return 0; }
  virtual void paint(QPainter& painter, const MapFrame& frame) const = 0;
  // What is said beside the pointer, and why it can't be.
  virtual QString text() const { return {}; }
  virtual QString fault() const { return {}; }
  // Makes the edit; why it can't be made, or empty.
  virtual std::string commit() = 0;
};

// An area by its border: it snaps to the points of its enclosing area.
std::unique_ptr<MapGrasp> graspArea(MapEditor& editor, const MapArea& area, MapPoint held);
// A point of a feature.
std::unique_ptr<MapGrasp> graspVertex(MapEditor& editor, const MapFeature& feature, std::size_t vertex);
// A new feature, of as many clicks as it needs, or as the user makes; of the page where there are several
// lists of its kind, else 0.
std::unique_ptr<MapGrasp> graspNewFeature(MapEditor& editor, MapKind kind, std::size_t least,
                                          std::size_t most, std::int32_t page);
// A rectangle from a corner to the opposite one, that becomes a feature.
std::unique_ptr<MapGrasp> graspRectangle(MapEditor& editor, MapKind kind, MapPoint corner, std::int32_t page);
// Points for a cell of a page; who stores them there is told.
std::unique_ptr<MapGrasp> graspPick(MapEditor& editor, const CellPick& cell,
                                    std::function<void(const std::vector<PickedPlace>&)> picked);
// A rectangle that becomes a nested area; who asks for its files is told both corners.
std::unique_ptr<MapGrasp> graspNestedArea(MapEditor& editor, MapPoint corner,
                                          std::function<void(MapPoint, MapPoint)> wanted);

}  // namespace gridbay::shell

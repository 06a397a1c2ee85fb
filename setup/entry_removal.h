#pragma once

namespace gridbay {

class CGlobalKvs;

// The entries behind a number (from 1) move up by one, so that the last one can go.
template <class List>
void moveUp(List& list, int number) {
  for (int next = number; next < list.GetCount(); ++next) list.at(next).AssignState(list.at(next + 1));
}

// Takes an entry out of a list that nobody follows; those behind it take its number. A number out of range
// is a std::invalid_argument.
template <class List>
void removeEntry(List& list, int number) {
  list.at(number);
  moveUp(list, number);
  list.SetCount(list.GetCount() - 1);
}

// The same for an open boundary, and for a source or sink, with what all modules say of it.
void removeBoundary(CGlobalKvs& root, int number);
void removeSource(CGlobalKvs& root, int number);
// The same for an area, from 2, that encloses none. Those behind it take its number everywhere; what stood on
// it stands on an area that is not there, as the check will say.
void removeArea(CGlobalKvs& root, int number);

}  // namespace gridbay

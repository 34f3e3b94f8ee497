// VPxUITableControl: the host's default table content, size and selection.
#include <openvorla/VPxUITableControl.h>

#include <standin/Lifetime.h>

#include <string>

OPENVORLA_NAMESPACE_OPEN

namespace {

VStatus outside() { return VStatus(VStatus::kInvalidParameter, "The cell is not in the table"); }

VStatus answer(VStatus *ReturnStatus, VStatus status) {
  if (ReturnStatus) *ReturnStatus = status;
  return status;
}

}  // namespace

VPxUITableControl::VPxUITableControl() : fRows(0), fColumns(0), fSuspended(false) {
  standin::noteConstructed("VPxUITableControl");
}

VPxUITableControl::~VPxUITableControl() { standin::noteDestroyed("VPxUITableControl"); }

VStatus VPxUITableControl::collapseOrExpandRows(bool) { return VStatus::kNotImplemented; }

VString VPxUITableControl::cellString(int, int, bool &isValidCell) {
  isValidCell = false;
  return VString();
}

VString VPxUITableControl::labelString(LabelType labelType, int index) {
  if (labelType != kRowLabel && labelType != kColumnLabel) return VString();
  return VString(std::to_string(index + 1).c_str());
}

bool VPxUITableControl::setCellString(int, int, const VString &) { return false; }
bool VPxUITableControl::allowEdit(int, int) const { return false; }
bool VPxUITableControl::allowSelection(int, int, int, int) const { return true; }

bool VPxUITableControl::inside(int row, int column) const {
  return row >= 0 && row < fRows && column >= 0 && column < fColumns;
}

VStatus VPxUITableControl::setNumberOfRows(int count) {
  if (count < 0) return VStatus(VStatus::kInvalidParameter, "Negative row count");
  fRows = count;
  fSelected.resize(count, std::vector<bool>(fColumns, false));
  return VStatus::kSuccess;
}

VStatus VPxUITableControl::setNumberOfColumns(int count) {
  if (count < 0) return VStatus(VStatus::kInvalidParameter, "Negative column count");
  fColumns = count;
  for (auto &row : fSelected) row.resize(count, false);
  return VStatus::kSuccess;
}

int VPxUITableControl::numberOfRows(VStatus *ReturnStatus) const {
  answer(ReturnStatus, VStatus::kSuccess);
  return fRows;
}

int VPxUITableControl::numberOfColumns(VStatus *ReturnStatus) const {
  answer(ReturnStatus, VStatus::kSuccess);
  return fColumns;
}

VStatus VPxUITableControl::setSelection(int top, int left, int bottom, int right) {
  if (!inside(top, left) || !inside(bottom, right) || top > bottom || left > right)
    return VStatus(VStatus::kInvalidParameter, "Not a rectangle of cells in the table");
  if (!allowSelection(top, left, bottom, right))
    return VStatus(VStatus::kFailure, "The control does not allow this selection");
  clearSelection();
  for (int row = top; row <= bottom; ++row)
    for (int column = left; column <= right; ++column) fSelected[row][column] = true;
  return VStatus::kSuccess;
}

VStatus VPxUITableControl::addToSelection(int row, int column) {
  if (!inside(row, column)) return outside();
  fSelected[row][column] = true;
  return VStatus::kSuccess;
}

VStatus VPxUITableControl::removeFromSelection(int row, int column) {
  if (!inside(row, column)) return outside();
  fSelected[row][column] = false;
  return VStatus::kSuccess;
}

VStatus VPxUITableControl::clearSelection() {
  for (auto &row : fSelected) row.assign(row.size(), false);
  return VStatus::kSuccess;
}

bool VPxUITableControl::isSelected(int row, int column, VStatus *ReturnStatus) const {
  if (!inside(row, column)) return answer(ReturnStatus, outside()), false;
  answer(ReturnStatus, VStatus::kSuccess);
  return fSelected[row][column];
}

unsigned int VPxUITableControl::selectedCellCount() const {
  unsigned int count = 0;
  for (const auto &row : fSelected)
    for (bool cell : row) count += cell ? 1 : 0;
  return count;
}

VStatus VPxUITableControl::suspendUpdates(bool suspend) {
  fSuspended = suspend;
  return VStatus::kSuccess;
}

VStatus VPxUITableControl::redrawCells() {
  return fSuspended ? VStatus(VStatus::kFailure, "Updates are suspended") : VStatus::kSuccess;
}

VStatus VPxUITableControl::redrawLabels() { return redrawCells(); }

OPENVORLA_NAMESPACE_CLOSE

// Base class of plug-in table controls.
//
// The host draws the table and asks the control for the text of each cell
// and label. The control keeps the table's size and its selection of cells;
// rows and columns count from 0.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VPxUIControl.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>

#include <vector>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxUITableControl : public VPxUIControl {
public:
  enum LabelType {
    kNoLabel,
    kRowLabel,
    kColumnLabel,
    kAllLabels
  };

  VPxUITableControl();
  ~VPxUITableControl() override;

  // Collapses or expands the groups of rows that the control shows;
  // kNotImplemented by default: the rows are not grouped.
  virtual VStatus collapseOrExpandRows(bool collapse);

  // Shrinking the table drops the selected cells that it loses.
  VStatus setNumberOfRows(int count);
  VStatus setNumberOfColumns(int count);
  int numberOfRows(VStatus *ReturnStatus = NULL) const;
  int numberOfColumns(VStatus *ReturnStatus = NULL) const;

  // Selects the rectangle instead of the selection; kInvalidParameter for
  // cells outside the table or corners out of order, kFailure when
  // allowSelection() refuses.
  VStatus setSelection(int top, int left, int bottom, int right);
  // kInvalidParameter for a cell outside the table.
  VStatus addToSelection(int row, int column);
  VStatus removeFromSelection(int row, int column);
  VStatus clearSelection();
  bool isSelected(int row, int column, VStatus *ReturnStatus = NULL) const;
  unsigned int selectedCellCount() const;

  // While updates are suspended the host does not redraw; the redraw
  // requests then fail with kFailure.
  VStatus suspendUpdates(bool suspend);
  VStatus redrawCells();
  VStatus redrawLabels();

protected:
  // The host asks these as it draws and edits the table.
  // The text of a cell; "" and isValidCell false by default.
  virtual VString cellString(int row, int column, bool &isValidCell);
  // Row and column labels number them from 1 by default; "" for the others.
  virtual VString labelString(LabelType labelType, int index);
  // The user typed value into the cell; false by default: the edit is refused.
  virtual bool setCellString(int row, int column, const VString &value);
  virtual bool allowEdit(int row, int column) const;  // false
  // Whether the user may select the rectangle of cells; true by default.
  virtual bool allowSelection(int top, int left, int bottom, int right) const;

private:
  bool inside(int row, int column) const;
  int fRows;
  int fColumns;
  bool fSuspended;
  std::vector<std::vector<bool>> fSelected;
};

OPENVORLA_NAMESPACE_CLOSE

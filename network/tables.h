// Narrowing of texts to the rows of a table.
#pragma once

#include <cstdint>
#include <span>
#include <vector>

#include "network/semantics.h"
#include "network/status.h"
#include "network/store.h"

namespace zornet {

// The rows, whose texts are numbers in the ascending list of the texts of their column.
class Table {
 public:
  Table(const Rows& rows, std::size_t columns);  // throws std::invalid_argument

  bool Has(std::span<const Exact> texts) const;
  std::size_t CountRows() const { return mCells.size() / mColumns.size(); }
  const std::vector<ZORString>& TextsOf(std::size_t column) const { return mColumns[column]; }
  std::size_t Cell(std::size_t row, std::size_t column) const { return mCells[row * mColumns.size() + column]; }
  const ZORString& TextAt(std::size_t row, std::size_t column) const { return mColumns[column][Cell(row, column)]; }

 private:
  std::vector<std::vector<ZORString>> mColumns;
  std::vector<std::uint32_t> mCells;  // row by row
};

class Tables {
 public:
  explicit Tables(Store& store) : mStore(store) {}

  Status Narrow(const Constraint& constraint);

 private:
  void Prepare(const Constraint& constraint);
  bool IsPossible(const Constraint& constraint, std::size_t row) const;
  void Meet(const Constraint& constraint, std::size_t column);

  Store& mStore;
  // By column of the table and number of its text: whether the variable can have it, and whether a possible row has it.
  std::vector<std::vector<char>> mPossible, mKept;
  std::vector<std::size_t> mFirst;  // by column, the first one of the same variable
};

}  // namespace zornet

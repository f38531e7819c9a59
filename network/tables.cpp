#include "network/tables.h"

#include <algorithm>
#include <stdexcept>

namespace zornet {

Table::Table(const Rows& rows, std::size_t columns) : mColumns(columns), mCells(rows.rows.size() * columns) {
  if (rows.rows.empty()) throw std::invalid_argument("a table has at least one row");
  for (const auto& row : rows.rows) {
    if (row.size() != columns)
      throw std::invalid_argument("a row has " + std::to_string(columns) + " texts here, not " +
                                  std::to_string(row.size()));
    for (std::size_t i = 0; i < columns; ++i) mColumns[i].push_back(ToZor(row[i]));
  }
  for (std::size_t i = 0; i < columns; ++i) {
    auto& texts = mColumns[i];
    std::sort(texts.begin(), texts.end());
    texts.erase(std::unique(texts.begin(), texts.end()), texts.end());
    for (std::size_t row = 0; row < rows.rows.size(); ++row) {
      const auto at = std::lower_bound(texts.begin(), texts.end(), ToZor(rows.rows[row][i]));
      mCells[row * columns + i] = static_cast<std::uint32_t>(at - texts.begin());
    }
  }
}

bool Table::Has(std::span<const Exact> texts) const {
  const auto is = [&](std::size_t row) {
    for (std::size_t i = 0; i < texts.size(); ++i) {
      if (!(TextAt(row, i) == *texts[i].text)) return false;
    }
    return true;
  };
  for (std::size_t row = 0; row < CountRows(); ++row) {
    if (is(row)) return true;
  }
  return false;
}

Status Tables::Narrow(const Constraint& constraint) {
  const Table& table = *constraint.table;
  Prepare(constraint);
  for (std::size_t row = 0; row < table.CountRows(); ++row) {
    if (!IsPossible(constraint, row)) continue;
    for (std::size_t i = 0; i < mKept.size(); ++i) mKept[i][table.Cell(row, i)] = 1;
  }
  mStore.StartOperation(Operation::Supports);
  bool exact = true;
  for (std::size_t i = 0; i < mKept.size() && !mStore.HasFailed(); ++i) {
    Meet(constraint, i);
    exact = exact && mStore[constraint.arguments[i]].IsOne();
  }
  return exact ? Status::Subsumed : Status::Fixpoint;
}

void Tables::Prepare(const Constraint& constraint) {
  const std::size_t columns = constraint.arguments.size();
  mPossible.resize(columns);
  mKept.resize(columns);
  mFirst.resize(columns);
  for (std::size_t i = 0; i < columns; ++i) {
    const auto& texts = constraint.table->TextsOf(i);
    const auto same = std::find(constraint.arguments.begin(), constraint.arguments.end(), constraint.arguments[i]);
    mFirst[i] = static_cast<std::size_t>(same - constraint.arguments.begin());
    mKept[i].assign(texts.size(), 0);
    const Listing& listing = mStore.List(constraint.arguments[i]);
    mPossible[i].assign(texts.size(), listing.known ? 0 : 1);
    auto held = listing.texts.begin();
    for (std::size_t at = 0; at < texts.size() && listing.known; ++at) {
      while (held != listing.texts.end() && *held < texts[at]) ++held;
      mPossible[i][at] = held != listing.texts.end() && *held == texts[at] ? 1 : 0;
    }
  }
}

bool Tables::IsPossible(const Constraint& constraint, std::size_t row) const {
  const Table& table = *constraint.table;
  for (std::size_t i = 0; i < mFirst.size(); ++i) {
    if (mPossible[i][table.Cell(row, i)] == 0) return false;
    if (mFirst[i] != i && !(table.TextAt(row, i) == table.TextAt(row, mFirst[i]))) return false;
  }
  return true;
}

void Tables::Meet(const Constraint& constraint, std::size_t column) {
  const auto& texts = constraint.table->TextsOf(column);
  const auto count = static_cast<std::size_t>(std::count(mKept[column].begin(), mKept[column].end(), 1));
  const Listing& listing = mStore.List(constraint.arguments[column]);
  if (listing.known && listing.count == count) return;
  std::vector<ZORString> kept;
  kept.reserve(count);
  for (std::size_t at = 0; at < texts.size(); ++at) {
    if (mKept[column][at] != 0) kept.push_back(texts[at]);
  }
  mStore.MeetTexts(constraint.arguments[column], std::move(kept));
}

}  // namespace zornet

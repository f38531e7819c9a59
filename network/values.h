// Values of the solver, made through the descriptors of its modules and reached through their virtual operations.
//
// A set lists the greatest text like any other and never takes the state Max, which the module's set operations lose
// beside other texts. A single value that is the greatest text always has that state.
#pragma once

#include <array>
#include <span>
#include <string>
#include <vector>

#include "host/ZORNumbers.h"
#include "host/ZORSolver.h"
#include "module/ZORVaDoString.h"
#include "network/ZORNetwork.h"
#include "network/texts.h"

namespace zornet {

// The descriptors of the value types. They belong to their modules.
class Types {
 public:
  // Throws ModuleFailure with the name of a type that neither module has.
  Types(const ZORVaDoModule& strings, const ZORVaDoModule& numbers);

  const ZORVaDoObjectDescriptor& operator[](Sort sort) const { return *mDescriptors[static_cast<std::size_t>(sort)]; }

 private:
  std::array<const ZORVaDoObjectDescriptor*, kSorts> mDescriptors;
};

// One value, Undefined at first. Owns its memory.
class Value {
 public:
  Value(const Types& types, Sort sort);
  ~Value();
  Value(const Value& other);
  Value(Value&& other) noexcept;
  Value& operator=(Value other) noexcept;

  zornet::Sort Sort() const { return mSort; }
  ZORVaDoAny& Any() { return *mValue; }
  const ZORVaDoAny& Any() const { return *mValue; }
  ZORVaDoString& Text() { return static_cast<ZORVaDoString&>(*mValue); }
  const ZORVaDoString& Text() const { return static_cast<const ZORVaDoString&>(*mValue); }
  ZORVaDoInteger& Integer() { return static_cast<ZORVaDoInteger&>(*mValue); }
  const ZORVaDoInteger& Integer() const { return static_cast<const ZORVaDoInteger&>(*mValue); }
  ZORVaDoBoolean& Boolean() { return static_cast<ZORVaDoBoolean&>(*mValue); }
  const ZORVaDoBoolean& Boolean() const { return static_cast<const ZORVaDoBoolean&>(*mValue); }

  bool IsNil() const { return mValue->IsNil() != 0; }
  bool IsUndefined() const { return mValue->IsUndefined() != 0; }
  bool IsKnown() const { return !IsNil() && !IsUndefined(); }
  bool IsOne() const;  // exactly one text, number or truth value is possible

  // Replace what is held; the sort has to fit.
  void Reset() { mValue->SetUndefinedValue(); }
  void SetText(const ZORString& text);
  void SetTexts(std::span<const ZORString> texts);       // of a set; in ascending order, at least one
  void SetNumber(ZORLong number);                        // of a Boolean 0 or 1
  void SetNumbers(const std::vector<ZORLong>& numbers);  // ascending; an interval takes the ends, a single one or all
  void SetRange(ZORLong lowest, ZORLong highest);        // of an interval or a Boolean; lowest <= highest

  // What a known value holds; of numbers also what an Undefined one does.
  ZORString LowestText() const;
  ZORString HighestText() const;
  std::vector<ZORString> Texts() const;                // in ascending order
  void AddTexts(std::vector<ZORString>& texts) const;  // behind those that are there
  ZORLong LowestNumber() const;                        // of a Boolean 0 or 1
  ZORLong HighestNumber() const;
  std::vector<ZORLong> Numbers() const;

  std::string Show() const;   // as models write it
  std::string Print() const;  // as the module prints it: the greatest text of a set in full

 private:
  Value(const ZORVaDoObjectDescriptor* descriptor, zornet::Sort sort);
  ZORString TextOfBound(ZORString bound) const;
  std::string ShowWithMax() const;
  std::string ShowEscaped() const;

  const ZORVaDoObjectDescriptor* mDescriptor;
  ZORVaDoAny* mValue;
  zornet::Sort mSort;
};

}  // namespace zornet

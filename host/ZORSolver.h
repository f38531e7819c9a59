// The solver runtime as its modules see it: objects, values, the descriptors that make values, modules and their
// manager. The declaration order of virtual functions is part of the binary interface.
//
// An operation named Calc... narrows one target: *this, or for a const operation its only non-const argument. It
// returns 1 when the target changed, else 0. A contradiction makes the target Nil. No reference to an operand is kept.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

#include "host/ZORExport.h"
#include "host/ZORText.h"

class ZORVaDoBoolean;
class ZORVaDoModule;
class ZORVaDoModuleManager;
class ZORVaDoNetwork;
class ZORVaDoObjectDescriptor;
class ZORVaDoObjectEnvironment;

// Root of the solver's classes. A type is identified by the address of its sIdent.
class ZOR_EXPORT ZORVaDoBase : public ZORStreamable {
 public:
  static const char* const sIdent;

  static void* operator new(std::size_t size) noexcept;  // null when there is no memory
  static void* operator new(std::size_t, void* place) noexcept { return place; }
  static void operator delete(void* memory) noexcept;
  static void operator delete(void*, void*) noexcept {}

  // Stream factory of an abstract class: returns its argument.
  static ZORStreamable* Build(ZORStreamable* object) { return object; }

  // Downcasts an object made by a stream; null when its class does not derive from this one. No ownership changes.
  static ZORVaDoBase* FromStream(ZORStreamable* object);

  // Whether object is of the class with this ident or of a derived one; false for null.
  static bool IsKindOf(const ZORVaDoBase* object, const char* ident) {
    return object != nullptr && object->IsDerivedFrom(ident) != 0;
  }

 protected:
  virtual int IsDerivedFrom(const char* ident) const;
};

// Casts of a class with an sIdent; null for null and for an object of another class.
#define ZOR_DECLARE_CASTS(Class)                                                   \
  static Class* DynamicCast(ZORVaDoBase* object) {                                 \
    return IsKindOf(object, sIdent) ? static_cast<Class*>(object) : nullptr;       \
  }                                                                                \
  static const Class* DynamicCast(const ZORVaDoBase* object) {                     \
    return IsKindOf(object, sIdent) ? static_cast<const Class*>(object) : nullptr; \
  }                                                                                \
  static_assert(true)

// An object of the solver's network. Activate, ActivateByArgument and Filter do nothing unless a class overrides them.
class ZOR_EXPORT ZORVaDoObject : public ZORVaDoBase {
 public:
  static const char* const sIdent;

  enum FilterResult { ZorFilterUnchanged, ZorFilterChanged, ZorFilterFailed };

  ~ZORVaDoObject() override;
  virtual const ZORVaDoObjectDescriptor* GetDescriptor() const;
  virtual void Activate(ZORVaDoNetwork* network);
  virtual void ActivateByArgument(unsigned int argument, std::int64_t offset, ZORVaDoNetwork* network);
  virtual FilterResult Filter(const ZORVaDoObjectEnvironment& environment, std::int64_t offset);
  virtual void PrintOn(ZORostrstream& out) const;  // writes the text form
  virtual void InputValue(ZORistrstream& in);      // reads it; bad input makes a value Nil

 protected:
  int IsDerivedFrom(const char* ident) const override;
};

// The domain of a variable: what it can still be. Nil is the empty domain, Undefined the full one.
class ZOR_EXPORT ZORVaDoAny : public ZORVaDoObject {
 public:
  static const char* const sIdent;

  // The part that Bisect keeps. Other numbers may be passed, too.
  enum ValueSelection : int { ZorSelectLeast, ZorSelectGreatest, ZorSelectLowerHalf, ZorSelectUpperHalf };

  // Whole domains. Assign copies other, Intersect keeps what both have, Unite adds what other has; all three make the
  // value Nil when other is of an unrelated class. IsIntersected: whether both share an element. Bisect keeps the
  // selected part and moves the rest to other. Width and cardinality count elements; the relative width is the width
  // divided by whole, or 0 unless whole is positive.
  // clang-format off
  virtual void          Assign            (const ZORVaDoAny& other) = 0;
  virtual void          SetNilValue       () = 0;
  virtual void          SetUndefinedValue () = 0;
  virtual int           IsNil             () const = 0;
  virtual int           IsUndefined       () const = 0;
  virtual int           IsIntersected     (const ZORVaDoAny& other) const = 0;
  virtual void          Intersect         (const ZORVaDoAny& other) = 0;
  virtual void          Unite             (const ZORVaDoAny& other) = 0;
  virtual unsigned long GetCardinality    () const = 0;
  virtual double        GetWidth          () const;
  virtual double        GetRelativeWidth  (double whole) const;
  virtual void          Bisect            (ZORVaDoObject& other, ValueSelection selection) = 0;

  // Relations of *this and other: =, <>, <=, >. CalcIs... narrows the Boolean result to whether the relation holds.
  // CalcMinValue and CalcMaxValue: *this = min(x, y), max(x, y); without operands, *this = the least, greatest element.
  virtual int CalcMinValue                     (const ZORVaDoAny& x, const ZORVaDoAny& y) = 0;
  virtual int CalcMinValue                     () = 0;
  virtual int CalcMaxValue                     (const ZORVaDoAny& x, const ZORVaDoAny& y) = 0;
  virtual int CalcMaxValue                     () = 0;
  virtual int CalcEqualValue                   (const ZORVaDoAny& other) = 0;
  virtual int CalcInverseEqualValue            (ZORVaDoAny& target) const = 0;
  virtual int CalcUnequalValue                 (const ZORVaDoAny& other) = 0;
  virtual int CalcInverseUnequalValue          (ZORVaDoAny& target) const = 0;
  virtual int CalcIsEqual                      (const ZORVaDoAny& other, ZORVaDoBoolean& result) const = 0;
  virtual int CalcLessOrEqualValue             (const ZORVaDoAny& other) = 0;
  virtual int CalcInverseLessOrEqualValue      (ZORVaDoAny& target) const = 0;
  virtual int CalcNotLessAndUnequalValue       (const ZORVaDoAny& other) = 0;
  virtual int CalcInverseNotLessAndUnequalValue(ZORVaDoAny& target) const = 0;
  virtual int CalcIsLessOrEqual                (const ZORVaDoAny& other, ZORVaDoBoolean& result) const = 0;
  virtual int CalcFirstInverseMinValue         (ZORVaDoAny& target, const ZORVaDoAny& second) const = 0;
  virtual int CalcFirstInverseMaxValue         (ZORVaDoAny& target, const ZORVaDoAny& second) const = 0;
  // clang-format on

 protected:
  int IsDerivedFrom(const char* ident) const override;
};

// Overrides of every concrete class of values.
#define ZOR_DECLARE_VALUE_OPERATIONS()                                                       \
  void Write(ZORopstream& out) const override;                                               \
  void Read(ZORipstream& in) override;                                                       \
  void PrintOn(ZORostrstream& out) const override;                                           \
  void InputValue(ZORistrstream& in) override;                                               \
  void Assign(const ZORVaDoAny& other) override;                                             \
  int IsIntersected(const ZORVaDoAny& other) const override;                                 \
  void Intersect(const ZORVaDoAny& other) override;                                          \
  void Unite(const ZORVaDoAny& other) override;                                              \
  void Bisect(ZORVaDoObject& other, ValueSelection selection) override;                      \
  int CalcMinValue(const ZORVaDoAny& x, const ZORVaDoAny& y) override;                       \
  int CalcMinValue() override;                                                               \
  int CalcMaxValue(const ZORVaDoAny& x, const ZORVaDoAny& y) override;                       \
  int CalcMaxValue() override;                                                               \
  int CalcEqualValue(const ZORVaDoAny& other) override;                                      \
  int CalcInverseEqualValue(ZORVaDoAny& target) const override;                              \
  int CalcLessOrEqualValue(const ZORVaDoAny& other) override;                                \
  int CalcInverseLessOrEqualValue(ZORVaDoAny& target) const override;                        \
  int CalcNotLessAndUnequalValue(const ZORVaDoAny& other) override;                          \
  int CalcInverseNotLessAndUnequalValue(ZORVaDoAny& target) const override;                  \
  int CalcFirstInverseMinValue(ZORVaDoAny& target, const ZORVaDoAny& second) const override; \
  int CalcFirstInverseMaxValue(ZORVaDoAny& target, const ZORVaDoAny& second) const override; \
  static_assert(true)

// A domain whose elements are ordered.
class ZOR_EXPORT ZORVaDoScalar : public ZORVaDoAny {
 public:
  static const char* const sIdent;
  static const ZORVaDoObjectDescriptor* const sDescriptor;  // "scalar", the parent of every ordered type

  ZORVaDoScalar() = default;
  explicit ZORVaDoScalar(ZORStreamableInit) {}

  // *this < other, *this >= other, *this = the successor of other, which is the least element greater than it.
  // clang-format off
  virtual int CalcLessValue          (const ZORVaDoScalar& other) = 0;
  virtual int CalcInverseLessValue   (ZORVaDoScalar& target) const = 0;
  virtual int CalcNotLessValue       (const ZORVaDoScalar& other) = 0;
  virtual int CalcInverseNotLessValue(ZORVaDoScalar& target) const = 0;
  virtual int CalcIsLess             (const ZORVaDoScalar& other, ZORVaDoBoolean& result) const = 0;
  virtual int CalcNextValue          (const ZORVaDoScalar& other) = 0;
  virtual int CalcInverseNextValue   (ZORVaDoScalar& target) const = 0;
  // clang-format on

 protected:
  int IsDerivedFrom(const char* ident) const override;
};

// Makes the values of one type, in memory of GetObjectSize() bytes that the caller owns.
class ZOR_EXPORT ZORVaDoObjectDescriptor : public ZORVaDoBase {
 public:
  static const char* const sIdent;

  // Copies name and stores flag, which is for the solver's use. A descriptor made while a module is being opened is
  // owned by that module, which deletes it when it is unloaded.
  ZORVaDoObjectDescriptor(const ZORString& name, const ZORVaDoObjectDescriptor* parent, int flag);
  explicit ZORVaDoObjectDescriptor(ZORStreamableInit);
  ~ZORVaDoObjectDescriptor() override;
  ZORVaDoObjectDescriptor(const ZORVaDoObjectDescriptor&) = delete;
  ZORVaDoObjectDescriptor& operator=(const ZORVaDoObjectDescriptor&) = delete;

  void Write(ZORopstream& out) const override;
  void Read(ZORipstream& in) override;

 protected:
  int IsDerivedFrom(const char* ident) const override;

 public:
  // CreateObject makes an Undefined value, or one from a zero-terminated text; null for a null place and for an
  // abstract type. DestroyObject runs the destructor and frees nothing; null is ignored. GetNumberOfArguments and
  // GetArgumentsSize return 0 unless overridden.
  virtual ZORVaDoObject* CreateObject(void* place, const void* text) const = 0;
  virtual ZORVaDoObject* CreateObject(void* place) const = 0;
  virtual void DestroyObject(ZORVaDoObject* object) const;
  virtual std::size_t GetObjectSize() const = 0;  // in bytes
  virtual unsigned int GetNumberOfArguments() const;
  virtual std::int64_t GetArgumentsSize() const;
  virtual int IsMatched(const ZORVaDoObjectDescriptor* other) const;  // 1 when other is this type or derived from it
  virtual void PrintOn(ZORostrstream& out) const;                     // writes the display name

  const ZORString& GetName() const { return mName; }
  const ZORVaDoObjectDescriptor* GetParent() const { return mParent; }
  int GetFlag() const { return mFlag; }

 private:
  friend class ZORVaDoModule;

  ZORString mName;
  const ZORVaDoObjectDescriptor* mParent = nullptr;
  int mFlag = 0;
  ZORVaDoModule* mOwner = nullptr;
};

// An open module: the modules it needs and the value types it registered, each in order of registration.
class ZOR_EXPORT ZORVaDoModule {
 public:
  explicit ZORVaDoModule(const ZORString& name);
  virtual ~ZORVaDoModule();  // deletes the descriptors that it owns
  ZORVaDoModule(const ZORVaDoModule&) = delete;
  ZORVaDoModule& operator=(const ZORVaDoModule&) = delete;

  virtual void AddLoadedModule(ZORVaDoModule* module);                          // null is ignored
  virtual void AddObjectDescriptor(const ZORVaDoObjectDescriptor* descriptor);  // null is ignored

  const ZORString& GetName() const { return mName; }
  const std::vector<ZORVaDoModule*>& GetLoadedModules() const { return mLoadedModules; }
  const std::vector<const ZORVaDoObjectDescriptor*>& GetDescriptors() const { return mDescriptors; }
  const ZORVaDoObjectDescriptor* FindDescriptor(const ZORString& displayName) const;  // null when not registered

 private:
  friend class ZORVaDoObjectDescriptor;
  friend class ZORVaDoModuleManager;

  static void Adopt(ZORVaDoObjectDescriptor& descriptor);  // by the module that is being opened, if any
  void Forget(const ZORVaDoObjectDescriptor& descriptor);
  void Bequeath(ZORVaDoModule& heir);

  ZORString mName;
  std::vector<ZORVaDoModule*> mLoadedModules;
  std::vector<const ZORVaDoObjectDescriptor*> mDescriptors;
  std::vector<ZORVaDoObjectDescriptor*> mMade;  // owned, whether registered or not
};

// Opens modules by name, owns them, and unloads them in reverse order when it is destroyed. Values of a module's types
// must be destroyed before its manager. "ZORVadNumbers" is built in; any other name stands for lib<name>.so in the
// first folder of the search path that has it: the program's folder, those added, the folder of this library.
class ZOR_EXPORT ZORVaDoModuleManager {
 public:
  ZORVaDoModuleManager();
  virtual ~ZORVaDoModuleManager();
  ZORVaDoModuleManager(const ZORVaDoModuleManager&) = delete;
  ZORVaDoModuleManager& operator=(const ZORVaDoModuleManager&) = delete;

  // OpenModule returns the same object each time, which the manager owns, or null on failure; GetFailure then has
  // "file: reason". It is empty after a success.
  virtual ZORVaDoModule* OpenModule(const ZORString& name);
  void AddSearchPath(const ZORString& folder);
  const ZORString& GetFailure() const { return mFailure; }

 private:
  struct Opened {
    ZORVaDoModule* module;
    void* library;  // from dlopen; null for a built-in module
  };

  ZORVaDoModule* OpenNumbers(const ZORString& name);
  ZORVaDoModule* Load(const ZORString& name, const std::string& file);
  std::string TakeIntoUse(ZORVaDoModule& module, void* library);
  static void Unload(const Opened& opened);
  ZORVaDoModule* Fail(const std::string& file, const std::string& reason);

  std::vector<Opened> mOpened;  // a module comes after those it needs
  std::vector<std::string> mSearchPath;
  ZORString mFailure;
  ZORVaDoModuleManager* mNext;
};

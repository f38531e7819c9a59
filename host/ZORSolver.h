// The solver runtime as its modules see it: objects and values with their tables of virtual operations, the
// descriptors through which values are made, modules and their manager. The order in which virtual operations are
// declared is part of the binary interface.
//
// A narrowing operation (Calc...) answers 1 when it changed its target and 0 when it did not; a contradiction makes
// the target Nil. Its target is *this, or for a const operation its one argument that is not const.
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

// Root of the solver's classes. Types are told apart by the address of a class's sIdent.
class ZOR_EXPORT ZORVaDoBase : public ZORStreamable {
 public:
  static const char* const sIdent;

  static void* operator new(std::size_t size) noexcept;  // null when there is no memory
  static void* operator new(std::size_t, void* place) noexcept { return place; }
  static void operator delete(void* memory) noexcept;
  static void operator delete(void*, void*) noexcept {}

  // Factory of the classes that cannot be made: answers what it is given.
  static ZORStreamable* Build(ZORStreamable* object) { return object; }

  // What a stream made as one of the solver's objects, which can be asked for its type; null when it is none.
  static ZORVaDoBase* FromStream(ZORStreamable* object);

  // Whether object is of the class with this ident or of one below it; no for a null object.
  static bool IsKindOf(const ZORVaDoBase* object, const char* ident) {
    return object != nullptr && object->IsDerivedFrom(ident) != 0;
  }

 protected:
  virtual int IsDerivedFrom(const char* ident) const;
};

// An object of the solver's network.
class ZOR_EXPORT ZORVaDoObject : public ZORVaDoBase {
 public:
  static const char* const sIdent;

  enum FilterResult { ZorFilterUnchanged, ZorFilterChanged, ZorFilterFailed };

  ~ZORVaDoObject() override;
  virtual const ZORVaDoObjectDescriptor* GetDescriptor() const;
  virtual void Activate(ZORVaDoNetwork* network);
  virtual void ActivateByArgument(unsigned int argument, std::int64_t offset, ZORVaDoNetwork* network);
  virtual FilterResult Filter(const ZORVaDoObjectEnvironment& environment, std::int64_t offset);
  virtual void PrintOn(ZORostrstream& out) const;  // the text form
  virtual void InputValue(ZORistrstream& in);      // replaces the value by what the text says

 protected:
  int IsDerivedFrom(const char* ident) const override;
};

// Any value: what is still possible for a variable. Nil: nothing; Undefined: everything.
class ZOR_EXPORT ZORVaDoAny : public ZORVaDoObject {
 public:
  static const char* const sIdent;

  // Which part of a value Bisect leaves in it. Any other number may be passed.
  enum ValueSelection : int { ZorSelectLeast, ZorSelectGreatest, ZorSelectLowerHalf, ZorSelectUpperHalf };

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

// A value with an order.
class ZOR_EXPORT ZORVaDoScalar : public ZORVaDoAny {
 public:
  static const char* const sIdent;
  static const ZORVaDoObjectDescriptor* const sDescriptor;  // "scalar", the parent of every ordered type

  ZORVaDoScalar() = default;
  explicit ZORVaDoScalar(ZORStreamableInit) {}

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

// The maker of one value type. The memory of a value is the caller's: it has GetObjectSize bytes.
class ZOR_EXPORT ZORVaDoObjectDescriptor : public ZORVaDoBase {
 public:
  static const char* const sIdent;

  // name is copied; flag is kept as it is given. A descriptor made while a module is taken into use belongs to that
  // module's object, which deletes it when the module is unloaded.
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
  virtual ZORVaDoObject* CreateObject(void* place, const void* text) const = 0;  // known; null for a null place
  virtual ZORVaDoObject* CreateObject(void* place) const = 0;                    // Undefined; null for a null place
  virtual void DestroyObject(ZORVaDoObject* object) const;                       // runs the destructor, frees nothing
  virtual std::size_t GetObjectSize() const = 0;                                 // in bytes
  virtual unsigned int GetNumberOfArguments() const;
  virtual std::int64_t GetArgumentsSize() const;
  virtual int IsMatched(const ZORVaDoObjectDescriptor* other) const;  // 1 when other is this type or one below it
  virtual void PrintOn(ZORostrstream& out) const;                     // the display name

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

// A module that is in use: what it needs and what value types it brings, in the order in which they came.
class ZOR_EXPORT ZORVaDoModule {
 public:
  explicit ZORVaDoModule(const ZORString& name);
  virtual ~ZORVaDoModule();  // deletes the descriptors that were made for it
  ZORVaDoModule(const ZORVaDoModule&) = delete;
  ZORVaDoModule& operator=(const ZORVaDoModule&) = delete;

  virtual void AddLoadedModule(ZORVaDoModule* module);                          // null is ignored
  virtual void AddObjectDescriptor(const ZORVaDoObjectDescriptor* descriptor);  // null is ignored

  const ZORString& GetName() const { return mName; }
  const std::vector<ZORVaDoModule*>& GetLoadedModules() const { return mLoadedModules; }
  const std::vector<const ZORVaDoObjectDescriptor*>& GetDescriptors() const { return mDescriptors; }
  const ZORVaDoObjectDescriptor* FindDescriptor(const ZORString& displayName) const;  // null when there is none

 private:
  friend class ZORVaDoObjectDescriptor;
  friend class ZORVaDoModuleManager;

  static void Adopt(ZORVaDoObjectDescriptor& descriptor);  // by the module that is being taken into use, if any
  void Forget(const ZORVaDoObjectDescriptor& descriptor);
  void Bequeath(ZORVaDoModule& heir);

  ZORString mName;
  std::vector<ZORVaDoModule*> mLoadedModules;
  std::vector<const ZORVaDoObjectDescriptor*> mDescriptors;
  std::vector<ZORVaDoObjectDescriptor*> mMade;  // registered or not
};

// Opens modules by name and keeps them until it dies, then unloads them in reverse order. "ZORVadNumbers" is built
// in; any other name is the shared library lib<name>.so in the first folder of the search path that has it: the
// program's own folder, those added, that of this library. Values of a module's types must be gone before its manager.
class ZOR_EXPORT ZORVaDoModuleManager {
 public:
  ZORVaDoModuleManager();
  virtual ~ZORVaDoModuleManager();
  ZORVaDoModuleManager(const ZORVaDoModuleManager&) = delete;
  ZORVaDoModuleManager& operator=(const ZORVaDoModuleManager&) = delete;

  virtual ZORVaDoModule* OpenModule(const ZORString& name);  // the same object each time; null when it cannot
  void AddSearchPath(const ZORString& folder);
  const ZORString& GetFailure() const {
    return mFailure;
  }  // "file: reason" of the last OpenModule, empty if it went well

 private:
  struct Opened {
    ZORVaDoModule* module;
    void* library;  // of dlopen; null for what is built in
  };

  ZORVaDoModule* OpenNumbers(const ZORString& name);
  ZORVaDoModule* Load(const ZORString& name, const std::string& file);
  std::string TakeIntoUse(ZORVaDoModule& module, void* library);
  static void Unload(const Opened& opened);
  ZORVaDoModule* Fail(const std::string& file, const std::string& reason);

  std::vector<Opened> mOpened;  // what a module needs stands before it
  std::vector<std::string> mSearchPath;
  ZORString mFailure;
  ZORVaDoModuleManager* mNext;
};

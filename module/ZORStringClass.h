// Declarations that every string class has: identity, casts, stream functions, descriptor, operations.
#pragma once

#include "host/ZORSolver.h"

// Members of a string class. Its type is identified by the address of sIdent; CastableIdent is the same name, public.
// DynamicCast returns null for null and for an object of another class; StaticCast is unchecked.
// sDescriptor is null until MakeDescriptor has run. Each call of MakeDescriptor makes a new descriptor, which the class
// never frees, or returns null when out of memory. readPtr makes an object, which the caller owns, and readRef fills
// one; for an object of another class readPtr gives null and fails the stream.
#define ZOR_DECLARE_STRING_CLASS(Class)                                                                   \
 public:                                                                                                  \
  class ZOR_EXPORT Descriptor : public ZORVaDoObjectDescriptor {                                          \
   public:                                                                                                \
    Descriptor(const ZORString& name, const ZORVaDoObjectDescriptor* parent, int flag)                    \
        : ZORVaDoObjectDescriptor(name, parent, flag) {}                                                  \
    explicit Descriptor(ZORStreamableInit) : ZORVaDoObjectDescriptor(ZorStreamableInit) {}                \
    ~Descriptor() override;                                                                               \
    const char* CastableID() const override;                                                              \
    ZORVaDoObject* CreateObject(void* place, const void* text) const override;                            \
    ZORVaDoObject* CreateObject(void* place) const override;                                              \
    std::size_t GetObjectSize() const override;                                                           \
  };                                                                                                      \
  static const char* const CastableIdent;                                                                 \
  static const Descriptor* sDescriptor;                                                                   \
  static const Descriptor* MakeDescriptor();                                                              \
  ZOR_DECLARE_CASTS(Class);                                                                               \
  static Class* StaticCast(ZORVaDoBase* object) { return static_cast<Class*>(object); }                   \
  static const Class* StaticCast(const ZORVaDoBase* object) { return static_cast<const Class*>(object); } \
  static ZORipstream& readPtr(ZORipstream& in, Class*& object);                                           \
  static ZORipstream& readRef(ZORipstream& in, Class& object);                                            \
  static ZORopstream& writePtr(ZORopstream& out, const Class* object);                                    \
  static ZORopstream& writeRef(ZORopstream& out, const Class& object);                                    \
  const char* CastableID() const override;                                                                \
  const ZORVaDoObjectDescriptor* GetDescriptor() const override;                                          \
                                                                                                          \
 protected:                                                                                               \
  int IsDerivedFrom(const char* ident) const override;                                                    \
                                                                                                          \
 private:                                                                                                 \
  static const char* const sIdent;                                                                        \
                                                                                                          \
 public:                                                                                                  \
  static_assert(true)

// The overrides of a concrete class. The contracts of the operations stand at the typed forms of the class and in the
// base classes. SetLowerBound and SetUpperBound are new and end the virtual table.
#define ZOR_DECLARE_STRING_OPERATIONS()                                                                       \
  ZOR_DECLARE_VALUE_OPERATIONS();                                                                             \
  void SetNilValue() override;                                                                                \
  void SetUndefinedValue() override;                                                                          \
  int IsNil() const final { return mState == ZorStringNil; }                                                  \
  int IsUndefined() const final { return mState == ZorStringAny; }                                            \
  int CheckNil() const { return IsNil(); }                                                                    \
  int CheckAny() const { return IsUndefined(); }                                                              \
  unsigned long GetCardinality() const override;                                                              \
  int CalcLessValue(const ZORVaDoScalar& other) override;                                                     \
  int CalcInverseLessValue(ZORVaDoScalar& target) const override;                                             \
  int CalcNotLessValue(const ZORVaDoScalar& other) override;                                                  \
  int CalcInverseNotLessValue(ZORVaDoScalar& target) const override;                                          \
  int CalcNextValue(const ZORVaDoScalar& other) override;                                                     \
  int CalcInverseNextValue(ZORVaDoScalar& target) const override;                                             \
  int IsEmpty() const final;                                                                                  \
  int IsFull() const final;                                                                                   \
  void SetExactValue(const ZORString& text) override;                                                         \
  void InsertExactValue(const ZORString& text) override;                                                      \
  int RemoveExactValue(const ZORString& text) override;                                                       \
  ZORString GetLowerBound() const override;                                                                   \
  ZORString GetUpperBound() const override;                                                                   \
  ZORString GetNextExactValue(const ZORString& text) const override;                                          \
  ZORString GetPrevExactValue(const ZORString& text) const override;                                          \
  int CalcLength(ZORVaDoInteger& n) const override;                                                           \
  int CalcInverseLength(const ZORVaDoInteger& n) override;                                                    \
  int CalcStringRepresentation(const ZORVaDoAny& x) override;                                                 \
  int CalcInverseStringRepresentation(ZORVaDoAny& x) const override;                                          \
  int CalcLowerValue(const ZORVaDoString& x) override;                                                        \
  int CalcInverseLowerValue(ZORVaDoString& x) const override;                                                 \
  int CalcUpperValue(const ZORVaDoString& x) override;                                                        \
  int CalcInverseUpperValue(ZORVaDoString& x) const override;                                                 \
  int CalcConcatenation(const ZORVaDoString& x, const ZORVaDoString& y) override;                             \
  int CalcFirstInverseConcatenation(ZORVaDoString& x, const ZORVaDoString& y) const override;                 \
  int CalcSecondInverseConcatenation(const ZORVaDoString& x, ZORVaDoString& y) const override;                \
  int CalcSubString(const ZORVaDoString& x, const ZORVaDoInteger& start, const ZORVaDoInteger& end) override; \
  int CalcFirstInverseSubString(ZORVaDoString& x, const ZORVaDoInteger& start, const ZORVaDoInteger& end)     \
      const override;                                                                                         \
  int CalcSecondInverseSubString(const ZORVaDoString& x, ZORVaDoInteger& start, const ZORVaDoInteger& end)    \
      const override;                                                                                         \
  int CalcThirdInverseSubString(const ZORVaDoString& x, const ZORVaDoInteger& start, ZORVaDoInteger& end)     \
      const override;                                                                                         \
  virtual void SetLowerBound(const ZORString& text);                                                          \
  virtual void SetUpperBound(const ZORString& text);                                                          \
  static_assert(true)

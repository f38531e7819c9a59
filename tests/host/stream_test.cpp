#include <gtest/gtest.h>

#include <climits>
#include <memory>
#include <string>
#include <vector>

#include "host/ZORNumbers.h"
#include "host/ZORSolver.h"
#include "host/ZORText.h"

namespace {

// An object that refers to another, perhaps to itself.
class Node : public ZORStreamable {
 public:
  explicit Node(ZORLong number = 0) : mNumber(number) {}
  const char* CastableID() const override { return "Node"; }
  void Write(ZORopstream& out) const override {
    out << mNumber;
    out.WriteObjectPointer(mNext);
  }
  void Read(ZORipstream& in) override {
    in >> mNumber;
    mNext = static_cast<Node*>(in.ReadObjectPointer());
  }

  ZORLong mNumber;
  Node* mNext = nullptr;
};

const ZORStreamableClass kNodeRecord(
    "Node", [](ZORStreamable* object) -> ZORStreamable* { return object != nullptr ? object : new Node; }, 0);

// Reads, and frees what was made.
class Input : public ZORipstream {
 public:
  using ZORipstream::ZORipstream;
  explicit Input(const ZORopstream& out) : ZORipstream(out.Bytes()) {}
  ~Input() {
    for (ZORStreamable* object : Objects()) delete object;
  }
  ZORLong Number() {
    ZORLong value = -1;
    *this >> value;
    return value;
  }
  std::unique_ptr<char[]> Text() { return std::unique_ptr<char[]>(ReadString()); }
};

}  // namespace

TEST(BinaryStream, BytesAreTheSameOnEveryMachine) {
  ZORopstream out;
  out << 0x01020304 << -2;
  out.WriteString("ab");
  EXPECT_EQ(out.Bytes(), std::string("\4\3\2\1\xfe\xff\xff\xff\2\0\0\0ab", 14));
}

TEST(BinaryStream, ReadsBackWhatWasWritten) {
  ZORopstream out;
  out << INT_MIN << INT_MAX << 0;
  out.WriteString("");
  out.WriteString(std::string(1000, 'x').c_str());
  out.WriteString(nullptr);
  Input in(out);
  EXPECT_EQ(in.Number(), INT_MIN);
  EXPECT_EQ(in.Number(), INT_MAX);
  EXPECT_EQ(in.Number(), 0);
  EXPECT_STREQ(in.Text().get(), "");
  EXPECT_EQ(in.Text().get(), std::string(1000, 'x'));
  EXPECT_STREQ(in.Text().get(), "");
  EXPECT_TRUE(!in.Fail() && in.Left() == 0);
}

TEST(BinaryStream, ObjectsKeepTheirReferences) {
  Node a(1), b(2);
  a.mNext = &b;
  b.mNext = &a;
  ZORopstream out;
  out.WriteObjectPointer(nullptr);
  out.WriteObjectPointer(&a);
  out.WriteObjectPointer(&b);
  Input in(out);
  EXPECT_EQ(in.ReadObjectPointer(), nullptr);
  auto* first = static_cast<Node*>(in.ReadObjectPointer());
  ASSERT_NE(first, nullptr);
  EXPECT_EQ(first->mNumber, 1);
  ASSERT_NE(first->mNext, nullptr);
  EXPECT_EQ(first->mNext->mNumber, 2);
  EXPECT_EQ(first->mNext->mNext, first);
  EXPECT_EQ(in.ReadObjectPointer(), first->mNext);
  EXPECT_FALSE(in.Fail());
}

TEST(BinaryStream, FillsTheObjectGivenWhenItsClassFits) {
  ZORVadIntervalInteger stored(2, 9), filled;
  ZORopstream out;
  for (int i = 0; i < 3; ++i) out.WriteObject(&stored);
  Input in(out);
  ZORStreamable* object = &filled;
  in.ReadObject(object);
  EXPECT_EQ(filled.GetLower(), 2);
  EXPECT_EQ(filled.GetUpper(), 9);

  object = nullptr;
  in.ReadObject(object);
  const std::unique_ptr<ZORStreamable> made(object);
  ASSERT_NE(made, nullptr);
  EXPECT_STREQ(made->CastableID(), "ZORVadIntervalInteger");

  ZORVadSingleInteger other;
  other.SetExactValue(5);
  object = &other;
  in.ReadObject(object);
  EXPECT_TRUE(in.Fail());
  EXPECT_EQ(other.GetValue(), 5);
}

TEST(BinaryStream, AnUnknownClassIsNull) {
  class Unknown : public Node {
    const char* CastableID() const override { return "Unknown"; }
  } unknown;
  ZORopstream out;
  out.WriteObjectPointer(&unknown);
  Input in(out);
  EXPECT_EQ(in.ReadObjectPointer(), nullptr);
  EXPECT_TRUE(in.Fail());
}

TEST(BinaryStream, BrokenLengthsAndNumbers) {
  for (const ZORLong length : {-1, INT_MIN, 4, INT_MAX}) {
    ZORopstream out;
    out << length;
    Input in(out.Bytes() + "abc");
    EXPECT_EQ(in.Text(), nullptr) << length;
    EXPECT_TRUE(in.Fail()) << length;
    EXPECT_EQ(in.Number(), 0) << "nothing is read after a failure";
  }
  for (const ZORLong number : {-1, 2, INT_MAX}) {
    ZORopstream out;
    out << number;
    Input in(out);
    EXPECT_EQ(in.ReadObjectPointer(), nullptr) << number;
    EXPECT_TRUE(in.Fail()) << number;
  }
}

TEST(BinaryStream, NestingHasALimit) {
  ZORopstream out;
  for (ZORLong i = 1; i <= 200000; ++i) {
    out << i;
    out.WriteString("Node");
    out << i;
  }
  Input in(out);
  EXPECT_NE(in.ReadObjectPointer(), nullptr);
  EXPECT_TRUE(in.Fail());
}

TEST(BinaryStream, EveryTruncationFails) {
  ZORVadEnumInteger set;
  set.SetNilValue();
  for (const ZORLong value : {7, -3, 12}) set.Insert(value);
  Node node(4);
  ZORopstream out;
  out.WriteObjectPointer(ZORVadSingleInteger::sDescriptor);
  out.WriteObject(&set);
  out.WriteObjectPointer(&node);
  for (std::size_t length = 0; length <= out.Bytes().size(); ++length) {
    Input in(out.Bytes().substr(0, length));
    ZORVadEnumInteger filled;
    ZORStreamable* object = &filled;
    in.ReadObjectPointer();
    in.ReadObject(object);
    in.ReadObjectPointer();
    EXPECT_EQ(in.Fail(), length < out.Bytes().size()) << length;
  }
}

TEST(BinaryStream, DescriptorsComeBackWithTheirParents) {
  ZORopstream out;
  out.WriteObjectPointer(ZORVadEnumInteger::sDescriptor);
  Input in(out);
  const auto* descriptor = static_cast<ZORVaDoObjectDescriptor*>(in.ReadObjectPointer());
  ASSERT_NE(descriptor, nullptr);
  EXPECT_TRUE(descriptor->GetName() == "enum integer");
  EXPECT_EQ(descriptor->GetFlag(), 0);
  EXPECT_EQ(descriptor->GetObjectSize(), sizeof(ZORVadEnumInteger));
  ASSERT_NE(descriptor->GetParent(), nullptr);
  EXPECT_TRUE(descriptor->GetParent()->GetName() == "scalar");
  EXPECT_EQ(descriptor->GetParent()->GetFlag(), 1);
  EXPECT_FALSE(in.Fail());
}

// A descriptor by pointer, whose parent the stream goes on with.
ZORopstream& BeginDescriptor(ZORopstream& out) {
  out << 1;
  out.WriteString("ZORVadEnumInteger_Descriptor");
  out.WriteString("own");
  return out << 0;
}

TEST(BinaryStream, ADescriptorTakesNothingButADescriptorAboveItAsParent) {
  Node node;
  ZORVadSingleInteger value;
  for (const ZORStreamable* parent : std::initializer_list<const ZORStreamable*>{&node, &value}) {
    ZORopstream out;
    (BeginDescriptor(out) << 2).WriteObject(parent);
    Input in(out);
    EXPECT_EQ(static_cast<ZORVaDoObjectDescriptor*>(in.ReadObjectPointer())->GetParent(), nullptr);
    EXPECT_TRUE(in.Fail());
  }
  ZORopstream itself;
  Input in(BeginDescriptor(itself) << 1);
  const auto* descriptor = static_cast<ZORVaDoObjectDescriptor*>(in.ReadObjectPointer());
  EXPECT_EQ(ZORVaDoScalar::sDescriptor->IsMatched(descriptor), 0);
}

TEST(Registry, FindsTheLaterRecordAndForgetsTheDead) {
  static const char kSameText[] = "Twice";
  const ZORStreamableClass early("Twice", ZORVaDoBase::Build, 1);
  {
    const ZORStreamableClass late(kSameText, ZORVaDoBase::Build, 1);
    const ZORStreamableClass last("Other", ZORVaDoBase::Build, 1);
    EXPECT_EQ(ZORStreamableClass::Find("Twice"), &late);
  }
  EXPECT_EQ(ZORStreamableClass::Find("Twice"), &early);
  EXPECT_EQ(ZORStreamableClass::Find("Other"), nullptr);
}

TEST(TextInput, Lines) {
  const std::string full(254, 'x');
  const struct {
    const char* why;
    std::string text;
    unsigned int limit;
    std::string line, left;
  } rows[] = {
      // why, text, limit, line, what is left
      {"the delimiter is taken", "ab\"c", 254, "ab", "c"},
      {"nothing before the delimiter", "\"c", 254, "", "c"},
      {"the end of the text ends a line", "ab", 254, "ab", ""},
      {"no text at all", "", 254, "", ""},
      {"the limit", "abcd", 3, "abc", "d"},
      {"a delimiter right behind the limit is taken", "abc\"d", 3, "abc", "d"},
      {"the longest quoted text leaves nothing", full + "\"", 254, full, ""},
      {"one more leaves its rest", full + "y\"", 254, full, "y\""},
      {"no room", "ab", 0, "unchanged", "ab"},
  };
  for (const auto& row : rows) {
    char line[300] = "unchanged";
    ZORistrstream in(row.text.c_str(), 0);
    in.GetLine(line, row.limit, '"');
    EXPECT_EQ(line, row.line) << row.why;
    EXPECT_EQ(row.text.substr(row.text.size() - in.Left()), row.left) << row.why;
  }
}

TEST(TextInput, EndAndWhiteSpace) {
  ZORistrstream in(" \t\n\v\f\r\xe9\0x", 9);
  in >> ws;
  EXPECT_EQ(in.Peek(), 0xe9);
  in.Ignore();
  EXPECT_EQ(in.Peek(), 0) << "a zero within the size is a character";
  in.Ignore();
  in.Ignore();
  EXPECT_EQ(in.Peek(), ZORistrstream::kNoCharacter);
  char c = 'c';
  in.Ignore();
  in >> ws >> c;
  EXPECT_EQ(c, '\0');
  EXPECT_EQ(ZORistrstream(nullptr, 5).Peek(), ZORistrstream::kNoCharacter);
}

TEST(TextOutput, BufferIsZeroEndedByAZero) {
  ZORostrstream out;
  out << "ab" << 'c' << static_cast<const char*>(nullptr) << '\0';
  EXPECT_STREQ(out.Str(0), "abc");
  out.Freeze(0);
  EXPECT_EQ(out.View().size(), 4u);
}

#include <cvlog/CVMessageBuffer.h>
#include <gtest/gtest.h>

#include <cstdint>
#include <iomanip>
#include <iostream>
#include <locale>
#include <sstream>
#include <string>
#include <string_view>
#include <thread>
#include <vector>

namespace {

using CVLog::CVMessageBuffer;

/// What std::ostream makes of the value.
template <class Value>
std::string printed(const Value& value) {
  std::ostringstream stream;
  stream.imbue(std::locale::classic());
  stream << value;
  return stream.str();
}

/// The text that the buffer holds after each of these was inserted.
template <class... Values>
std::string textOf(const Values&... values) {
  CVMessageBuffer buffer;
  ((buffer << values), ...);
  return CVMessageBuffer::str(buffer);
}

TEST(MessageBuffer, TextStaysInTheOrderOfInsertionWithItsNullBytes) {
  EXPECT_EQ(textOf("first", std::string(" second\0", 8), " third"), std::string("first second\0 third", 19));
}

TEST(MessageBuffer, BufferIsEmptyAfterItsTextIsTaken) {
  CVMessageBuffer buffer;
  buffer << "a text that is longer than any short-string storage";
  (void)CVMessageBuffer::str(buffer);
  EXPECT_EQ(CVMessageBuffer::str(buffer), "");
  buffer << "next";
  EXPECT_EQ(CVMessageBuffer::str(buffer), "next");
}

TEST(MessageBuffer, NullTextAppendsNothing) {
  EXPECT_EQ(textOf("[", static_cast<const char*>(nullptr), "]"), "[]");
}

TEST(MessageBuffer, TextThatCanBeChangedIsText) {
  CVMessageBuffer buffer;
  char array[] = "array";
  char* pointer = array;
  std::string string = "string";
  buffer << array << ' ' << pointer << ' ' << string;
  EXPECT_EQ(CVMessageBuffer::str(buffer), "array array string");
}

TEST(MessageBuffer, PointersArePrintedAsTheStandardStreamDoes) {
  const std::vector<int> vector;
  EXPECT_EQ(textOf(&vector), printed(static_cast<const void*>(&vector)));
  for (const std::uintptr_t number : {std::uintptr_t{0}, std::uintptr_t{1}, ~std::uintptr_t{0}}) {
    const auto* const address = reinterpret_cast<const void*>(number);
    EXPECT_EQ(textOf(address), printed(address));
  }
}

TEST(MessageBuffer, ParameterListGoesOnAsAStream) {
  CVMessageBuffer buffer;
  const int broker = 0;
  const int* const properties = nullptr;
  std::ostream& stream = buffer << " isProc=" << true << " broker=" << &broker << " properties=" << properties
                                << " isObjPath=" << false;
  EXPECT_EQ(CVMessageBuffer::str(stream),
            " isProc=1 broker=" + printed(static_cast<const void*>(&broker)) + " properties=0 isObjPath=0");
}

TEST(MessageBuffer, OtherValuesArePrintedAsTheStandardStreamDoes) {
  enum Code { code = 24 };
  std::vector<bool> bits = {true};
  EXPECT_EQ(textOf(42U), "42");
  EXPECT_EQ(textOf(static_cast<unsigned short>(65535)), "65535");
  EXPECT_EQ(textOf(0L), "0");
  EXPECT_EQ(textOf('c'), "c");
  EXPECT_EQ(textOf(code), "24");
  EXPECT_EQ(textOf(std::string_view("view")), "view");
  EXPECT_EQ(textOf(bits[0]), "1");
  EXPECT_EQ(textOf(42U, ' ', -7, ' ', 2.5, ' ', ~0ULL), "42 -7 2.5 18446744073709551615");
}

TEST(MessageBuffer, StreamAndBufferAppendToTheSameText) {
  CVMessageBuffer buffer;
  buffer << "number=";
  std::ostream& stream = buffer;
  stream << 12 << ',';
  stream.put('x');
  buffer << " and text";
  EXPECT_EQ(CVMessageBuffer::str(stream), "number=12,x and text");
  stream << 2;
  EXPECT_EQ(CVMessageBuffer::str(buffer), "2");
}

TEST(MessageBuffer, StreamThatGotANullTextWorksAgain) {
  CVMessageBuffer buffer;
  const char* const missing = nullptr;
  std::ostream& stream = buffer << " key=" << true;
  stream << missing;
  ASSERT_TRUE(stream.bad());
  EXPECT_EQ(CVMessageBuffer::str(stream), " key=1");
  stream << " next=" << 5;
  stream << missing;
  buffer << " flag=" << true << " rest";
  EXPECT_EQ(CVMessageBuffer::str(buffer), " next=5 flag=1 rest");
}

TEST(MessageBuffer, FormatDoesNotReachTheNextMessageOrBuffer) {
  {
    CVMessageBuffer buffer;
    buffer << std::hex << std::showbase << std::boolalpha << std::setfill('*') << std::setw(6) << 255;
    EXPECT_EQ(CVMessageBuffer::str(buffer), "**0xff");
    std::ostream& stream = buffer << 255 << ' ' << true << ' ' << 3.14159265;
    EXPECT_EQ(CVMessageBuffer::str(stream), "255 1 3.14159");
    stream << std::hex << std::setw(9) << "lost";
    stream.exceptions(std::ios::badbit | std::ios::failbit);
    stream.tie(&std::cout);
  }
  CVMessageBuffer buffer;
  std::ostream& stream = buffer << 16;
  EXPECT_EQ(stream.tie(), nullptr);
  EXPECT_EQ(stream.exceptions(), std::ios::goodbit);
  EXPECT_EQ(CVMessageBuffer::str(stream), "16");
}

/// Groups digits by threes with a point, as no classic locale does.
class GroupedDigits : public std::numpunct<char> {
 protected:
  char do_thousands_sep() const override { return '.'; }
  std::string do_grouping() const override { return "\3"; }
};

TEST(MessageBuffer, NumbersHaveTheClassicLocale) {
  const std::locale before = std::locale::global(std::locale(std::locale::classic(), new GroupedDigits));
  CVMessageBuffer first;
  CVMessageBuffer second;  // two at once: at least one stream is made under the strange locale
  first << 1234567;
  second << 1234567;
  std::locale::global(before);
  EXPECT_EQ(CVMessageBuffer::str(first), "1234567");
  EXPECT_EQ(CVMessageBuffer::str(second), "1234567");

  static_cast<std::ostream&>(first).imbue(std::locale(std::locale::classic(), new GroupedDigits));
  first << 1234567;
  EXPECT_EQ(CVMessageBuffer::str(first), "1.234.567");
  first << 1234567;
  EXPECT_EQ(CVMessageBuffer::str(first), "1234567");
}

TEST(MessageBuffer, StreamOfAnotherClassHasNoText) {
  std::ostringstream foreign;
  foreign << "text";
  EXPECT_EQ(CVMessageBuffer::str(foreign), "");
}

TEST(MessageBuffer, BuffersInManyThreadsKeepTheirTextsApart) {
  constexpr int threadCount = 8;
  constexpr int roundCount = 2000;
  std::vector<int> wrong(threadCount, 0);
  std::vector<std::thread> threads;
  for (int number = 0; number < threadCount; ++number) {
    threads.emplace_back([number, &wrong] {
      for (int round = 0; round < roundCount; ++round) {
        CVMessageBuffer outer;
        CVMessageBuffer inner;
        outer << "thread " << number << " round " << round;
        inner << round;
        const bool right =
            CVMessageBuffer::str(inner) == std::to_string(round) &&
            CVMessageBuffer::str(outer) == "thread " + std::to_string(number) + " round " + std::to_string(round);
        wrong[static_cast<std::size_t>(number)] += right ? 0 : 1;
      }
    });
  }
  for (std::thread& thread : threads) {
    thread.join();
  }
  EXPECT_EQ(wrong, std::vector<int>(threadCount, 0));
}

}  // namespace

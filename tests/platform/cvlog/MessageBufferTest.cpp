#include <cvlog/CVMessageBuffer.h>
#include <gtest/gtest.h>

#include <cstdint>
#include <iomanip>
#include <iostream>
#include <limits>
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

TEST(MessageBuffer, HoldsTextInTheOrderOfInsertion) {
  CVMessageBuffer buffer;
  buffer << "first" << std::string(" second ") << "third";
  EXPECT_EQ(CVMessageBuffer::str(buffer), "first second third");
}

TEST(MessageBuffer, IsEmptyAfterItsTextIsTaken) {
  CVMessageBuffer buffer;
  buffer << "a text that is longer than any short-string storage";
  (void)CVMessageBuffer::str(buffer);
  EXPECT_EQ(CVMessageBuffer::str(buffer), "");
  buffer << "next";
  EXPECT_EQ(CVMessageBuffer::str(buffer), "next");
}

TEST(MessageBuffer, PrintsNothingForANullText) {
  CVMessageBuffer buffer;
  const char* const missing = nullptr;
  buffer << "[" << missing << "]";
  EXPECT_EQ(CVMessageBuffer::str(buffer), "[]");
}

TEST(MessageBuffer, KeepsNullBytesOfStrings) {
  CVMessageBuffer buffer;
  const std::string text("a\0b", 3);
  buffer << text;
  EXPECT_EQ(CVMessageBuffer::str(buffer), text);
}

TEST(MessageBuffer, TakesTextThatCanBeChanged) {
  CVMessageBuffer buffer;
  char array[] = "array";
  char* pointer = array;
  std::string string = "string";
  buffer << array << ' ' << pointer << ' ' << string;
  EXPECT_EQ(CVMessageBuffer::str(buffer), "array array string");
}

TEST(MessageBuffer, PrintsBoolsAsDigitsAndGoesOnAsAStream) {
  CVMessageBuffer buffer;
  std::ostream& stream = buffer << " isProc=" << true << " isMem=" << false << " isProcCore=" << true;
  EXPECT_EQ(CVMessageBuffer::str(stream), " isProc=1 isMem=0 isProcCore=1");
}

TEST(MessageBuffer, PrintsPointersAsTheStandardStreamDoes) {
  CVMessageBuffer buffer;
  const int object = 0;
  const std::vector<int> vector;
  const auto* const highest = reinterpret_cast<const void*>(std::numeric_limits<std::uintptr_t>::max());
  const auto* const lowest = reinterpret_cast<const void*>(std::uintptr_t{1});
  for (const void* address : {static_cast<const void*>(&object), static_cast<const void*>(&vector), highest, lowest,
                              static_cast<const void*>(nullptr)}) {
    buffer << address;
    EXPECT_EQ(CVMessageBuffer::str(buffer), printed(address));
  }
  buffer << &vector;
  EXPECT_EQ(CVMessageBuffer::str(buffer), printed(static_cast<const void*>(&vector)));
  EXPECT_EQ(printed(static_cast<const void*>(nullptr)), "0");
}

TEST(MessageBuffer, PrintsAParameterList) {
  CVMessageBuffer buffer;
  const int broker = 0;
  const int* const properties = nullptr;
  std::ostream& stream = buffer << " broker=" << &broker << " properties=" << properties << " isObjPath=" << false;
  EXPECT_EQ(CVMessageBuffer::str(stream),
            " broker=" + printed(static_cast<const void*>(&broker)) + " properties=0 isObjPath=0");
}

TEST(MessageBuffer, PrintsNumbersAsTheStandardStreamDoes) {
  CVMessageBuffer buffer;
  buffer << 42U << ' ' << -7 << ' ' << 2.5 << ' ' << std::numeric_limits<unsigned long long>::max();
  EXPECT_EQ(CVMessageBuffer::str(buffer), "42 -7 2.5 18446744073709551615");
  buffer << static_cast<unsigned short>(65535);
  EXPECT_EQ(CVMessageBuffer::str(buffer), "65535");
  buffer << 0L;
  EXPECT_EQ(CVMessageBuffer::str(buffer), "0");
  buffer << 'c';
  EXPECT_EQ(CVMessageBuffer::str(buffer), "c");
}

TEST(MessageBuffer, PrintsEnumeratorsViewsAndBitsOfVectors) {
  enum Code { code = 24 };
  CVMessageBuffer buffer;
  buffer << code;
  EXPECT_EQ(CVMessageBuffer::str(buffer), "24");
  buffer << std::string_view("view");
  EXPECT_EQ(CVMessageBuffer::str(buffer), "view");
  std::vector<bool> bits = {true};
  buffer << bits[0];
  EXPECT_EQ(CVMessageBuffer::str(buffer), "1");
}

TEST(MessageBuffer, ConvertsToAStreamThatWritesToIt) {
  CVMessageBuffer buffer;
  buffer << "number=";
  std::ostream& stream = buffer;
  stream << 12 << ',';
  stream.put('x');
  buffer << " and text";
  EXPECT_EQ(CVMessageBuffer::str(stream), "number=12,x and text");
}

TEST(MessageBuffer, StreamGoesOnAfterTheTextIsTaken) {
  CVMessageBuffer buffer;
  std::ostream& stream = buffer;
  stream << 1;
  EXPECT_EQ(CVMessageBuffer::str(stream), "1");
  stream << 2;
  EXPECT_EQ(CVMessageBuffer::str(buffer), "2");
}

TEST(MessageBuffer, StreamThatWasGivenANullTextWorksAgain) {
  CVMessageBuffer buffer;
  const char* const missing = nullptr;
  std::ostream& stream = buffer << " key=" << true;
  stream << missing;
  ASSERT_TRUE(stream.bad());
  EXPECT_EQ(CVMessageBuffer::str(stream), " key=1");
  stream << " next=" << 5;
  EXPECT_EQ(CVMessageBuffer::str(stream), " next=5");

  stream << missing;
  buffer << " flag=" << true << " rest";
  EXPECT_EQ(CVMessageBuffer::str(buffer), " flag=1 rest");
}

TEST(MessageBuffer, FormatOfOneMessageDoesNotReachTheNext) {
  CVMessageBuffer buffer;
  buffer << std::hex << std::showbase << std::boolalpha << std::setfill('*') << std::setw(6) << 255;
  EXPECT_EQ(CVMessageBuffer::str(buffer), "**0xff");
  std::ostream& stream = buffer << 255 << ' ' << true << ' ' << 3.14159265;
  EXPECT_EQ(CVMessageBuffer::str(stream), "255 1 3.14159");
}

TEST(MessageBuffer, StreamOfADeadBufferLeavesNothingBehind) {
  {
    CVMessageBuffer buffer;
    std::ostream& stream = buffer;
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

TEST(MessageBuffer, KeepsToTheClassicLocale) {
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

TEST(MessageBuffer, ManyBuffersAtOnceKeepTheirTextsApart) {
  std::vector<CVMessageBuffer> buffers(40);
  for (std::size_t round = 0; round < 3; ++round) {
    for (std::size_t index = 0; index < buffers.size(); ++index) {
      buffers[index] << "buffer " << index << " round " << round;
    }
    for (std::size_t index = 0; index < buffers.size(); ++index) {
      EXPECT_EQ(CVMessageBuffer::str(buffers[index]),
                "buffer " + std::to_string(index) + " round " + std::to_string(round));
    }
  }
}

TEST(MessageBuffer, YieldsNothingForAStreamThatIsNotItsOwn) {
  std::ostringstream foreign;
  foreign << "text";
  EXPECT_EQ(CVMessageBuffer::str(foreign), "");
}

TEST(MessageBuffer, ThreadsDoNotMixTheirTexts) {
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

#include "host/corvcim/text/CrashReport.h"

#include <unistd.h>

#include <array>
#include <csignal>
#include <cstddef>
#include <cstdlib>

#include "host/corvcim/text/LibraryErrors.h"
#include "host/corvcim/text/StandardStreams.h"

namespace Corvcim {
namespace {

constexpr std::array signals = {SIGSEGV, SIGBUS, SIGILL, SIGFPE, SIGABRT};

// What the handler may touch: made before, not changed while it can run.
std::array<char, 512> message;
std::size_t messageLength = 0;
std::array<struct sigaction, signals.size()> previous;

// A stack that has run out has no room for the handler.
std::array<std::byte, std::size_t{64} * 1024> ownStack;
stack_t previousStack;

void append(std::string_view text) {
  constexpr std::size_t roomForLineEnd = 1;
  messageLength += text.copy(message.data() + messageLength, message.size() - roomForLineEnd - messageLength);
}

void report(int) {
  LibraryErrors::show();
  writeToStandardError({message.data(), messageLength});
  _exit(EXIT_FAILURE);
}

}  // namespace

CrashReport::CrashReport(std::string_view text) {
  messageLength = 0;
  append("corvcim: ");
  append(text);
  message[messageLength++] = '\n';
  stack_t stack = {};
  stack.ss_sp = ownStack.data();
  stack.ss_size = ownStack.size();
  sigaltstack(&stack, &previousStack);
  struct sigaction action = {};
  action.sa_handler = report;
  action.sa_flags = SA_ONSTACK;
  for (std::size_t i = 0; i < signals.size(); ++i) {
    sigaction(signals[i], &action, &previous[i]);
  }
}

CrashReport::~CrashReport() {
  for (std::size_t i = 0; i < signals.size(); ++i) {
    sigaction(signals[i], &previous[i], nullptr);
  }
  sigaltstack(&previousStack, nullptr);
}

}  // namespace Corvcim

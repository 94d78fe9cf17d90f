// SPDX-License-Identifier: MIT
#include "tools/support/stack_guard.hpp"

#include <map>
#include <string_view>

#include "engine/endless_chains.hpp"
#include "text/number_conversion.hpp"

#if defined(__linux__)
#include <pthread.h>
#include <signal.h>  // NOLINT(modernize-deprecated-headers): the standard one has no alternate stacks
#include <unistd.h>
#endif

namespace qz::tools {

namespace {

struct Guarded {
  const QZ_Plist_State_Parser* engine = nullptr;
  std::map<toolkit::Tag, std::string>
      lineOf;             // messages, by the tag of the list that was started last
  std::string otherwise;  // the message for any other list
};

Guarded guarded;  // the script that runs; the tool has one thread

std::string lineFor(const std::string& name, const std::string& loop) {
  return "qz-walkthrough: " + name + ": the stack is exhausted: lists run each other endlessly (" +
         loop + ")\n";
}

}  // namespace

void guardScript(const QZ_Plist_State_Parser& engine, const std::string& name,
                 const toolkit::ValueRef<toolkit::Dictionary>& script) {
  const EndlessChains chains = endlessChains(script);
  Guarded next{&engine, {}, "qz-walkthrough: " + name + ": the stack is exhausted\n"};
  if (!chains.loops.empty()) next.otherwise = lineFor(name, chains.loops.front());
  for (const auto& [key, loop] : chains.loopOf) {
    next.lineOf[text::integerValueOf(key)] = lineFor(name, chains.loops[loop]);
  }
  guarded = std::move(next);
}

void forgetScript() { guarded = {}; }

#if defined(__linux__)

namespace {

// A bad access this close to the end of the stack, in bytes, counts as a stack overflow.
constexpr std::uintptr_t reach = 1 << 20;
constexpr unsigned patience = 2;  // seconds to wait for the engine's lock

std::uintptr_t stackEnd = 0;  // its lowest address
alignas(16) char signalStack[1 << 16];

[[noreturn]] void endWith(std::string_view line) {
  // If this fails, nobody is left to tell.
  [[maybe_unused]] const auto written = ::write(STDERR_FILENO, line.data(), line.size());
  ::_exit(static_cast<int>(stackExhausted));
}

// `onBadAccess` waits for a lock of the engine, which the list that crashed may hold for ever.
void onTooLong(int) { endWith(guarded.otherwise); }

void onBadAccess(int signal, siginfo_t* info, void*) {
  const auto address = reinterpret_cast<std::uintptr_t>(info->si_addr);
  if (!guarded.engine || address + reach < stackEnd || address > stackEnd + reach) {
    ::signal(signal, SIG_DFL);  // not the stack: the access is repeated, and crashes
    return;
  }
  ::alarm(patience);
  const auto line = guarded.lineOf.find(guarded.engine->lastTagId()->longValue());
  endWith(line == guarded.lineOf.end() ? guarded.otherwise : line->second);
}

void handle(int signal, struct sigaction action) { ::sigaction(signal, &action, nullptr); }

}  // namespace

void installStackGuard() {
  pthread_attr_t attributes;
  if (::pthread_getattr_np(::pthread_self(), &attributes) != 0) return;
  void* lowest = nullptr;
  std::size_t size = 0;
  ::pthread_attr_getstack(&attributes, &lowest, &size);
  ::pthread_attr_destroy(&attributes);
  stackEnd = reinterpret_cast<std::uintptr_t>(lowest);

  const stack_t alternate{.ss_sp = signalStack, .ss_flags = 0, .ss_size = sizeof signalStack};
  ::sigaltstack(&alternate, nullptr);
  struct sigaction action {};
  action.sa_flags = SA_SIGINFO | SA_ONSTACK;
  action.sa_sigaction = onBadAccess;
  handle(SIGSEGV, action);
  handle(SIGBUS, action);
  struct sigaction alarm {};
  alarm.sa_flags = SA_ONSTACK;
  alarm.sa_handler = onTooLong;
  handle(SIGALRM, alarm);
}

#else

void installStackGuard() {}

#endif

}  // namespace qz::tools

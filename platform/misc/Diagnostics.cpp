#include "platform/misc/Diagnostics.h"

#include <cstdio>

namespace {

struct State {
  Diagnostics::Sink sink;
  DiagLevel threshold = DiagLevel::Warning;
  int currentNumber = -1;
};

State& state() {
  static State s;
  return s;
}

const char* levelName(DiagLevel level) {
  switch (level) {
    case DiagLevel::Debug:
      return "debug";
    case DiagLevel::Info:
      return "info";
    case DiagLevel::Warning:
      return "warning";
    case DiagLevel::Error:
      return "error";
  }
  return "?";
}

}  // namespace

void Diagnostics::print(DiagLevel level, const String& text) {
  State& s = state();
  if (level < s.threshold) return;
  if (s.sink) {
    s.sink(level, text);
    return;
  }
  std::fprintf(stderr, "globkit %s: %s", levelName(level), text.c_str());
  if (text.empty() || text.back() != '\n') std::fputc('\n', stderr);
}

void Diagnostics::print(int numberedLevel, const String& text) {
  State& s = state();
  const int outer = s.currentNumber;
  s.currentNumber = numberedLevel;
  print(DiagLevel::Warning, text);
  s.currentNumber = outer;
}

int Diagnostics::numberOfCurrentLine() {
  return state().currentNumber;
}

void Diagnostics::setThreshold(DiagLevel level) {
  state().threshold = level;
}
DiagLevel Diagnostics::threshold() {
  return state().threshold;
}

Diagnostics::Sink Diagnostics::setSink(Sink sink) {
  Sink old = std::move(state().sink);
  state().sink = std::move(sink);
  return old;
}

Diagnostics::Capture::Capture() : previousThreshold_(threshold()) {
  setThreshold(DiagLevel::Debug);
  previous_ = setSink([this](DiagLevel, const String& text) {
    lines_.push_back(text);
    numbers_.push_back(numberOfCurrentLine());
  });
}

Diagnostics::Capture::~Capture() {
  setSink(std::move(previous_));
  setThreshold(previousThreshold_);
}

bool Diagnostics::Capture::contains(const String& fragment) const {
  for (const String& l : lines_) {
    if (l.find(fragment) != String::npos) return true;
  }
  return false;
}

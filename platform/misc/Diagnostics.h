#pragma once
// The diagnostic printer: one line per problem, with a level. Lines go to stderr unless a sink
// is installed (tests install one to look at what was reported).
#include <functional>
#include <vector>

#include "platform/kw/String.h"

enum class DiagLevel { Debug = 0, Info = 1, Warning = 2, Error = 3 };

class Diagnostics {
 public:
  using Sink = std::function<void(DiagLevel, const String&)>;

  // Prints `text` when `level` is at or above the threshold. The text is printed as given:
  // callers that want a line break include it.
  static void print(DiagLevel level, const String& text);
  // The older numbered form, for reports whose number is part of their contract: the line is
  // printed at Warning severity and the number travels with it (numberOfCurrentLine() inside
  // a sink, Capture::numbers()). Lines printed by the other form carry -1.
  static void print(int numberedLevel, const String& text);
  static int numberOfCurrentLine();
  static void setThreshold(DiagLevel level);
  static DiagLevel threshold();

  // Replaces the sink; returns the previous one. An empty sink restores stderr.
  static Sink setSink(Sink sink);

  // Collects every line reported while it lives (and passes nothing to stderr).
  class Capture {
   public:
    Capture();
    ~Capture();
    Capture(const Capture&) = delete;
    Capture& operator=(const Capture&) = delete;

    const std::vector<String>& lines() const { return lines_; }
    // The number of each line (-1 for lines without one), in step with lines().
    const std::vector<int>& numbers() const { return numbers_; }
    bool contains(const String& fragment) const;
    void clear() {
      lines_.clear();
      numbers_.clear();
    }

   private:
    std::vector<String> lines_;
    std::vector<int> numbers_;
    Sink previous_;
    DiagLevel previousThreshold_;
  };
};

// Shorthands for the common levels.
inline void diagWarning(const String& text) {
  Diagnostics::print(DiagLevel::Warning, text);
}
inline void diagError(const String& text) {
  Diagnostics::print(DiagLevel::Error, text);
}

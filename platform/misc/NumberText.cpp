#include "platform/misc/NumberText.h"

#include <charconv>
#include <cmath>

namespace {

// The text without surrounding blanks and with one leading '+' dropped: from_chars accepts a
// '-' sign only.
std::string_view numberPart(std::string_view s) {
  const auto blank = [](char c) { return c == ' ' || c == '\t'; };
  while (!s.empty() && blank(s.front())) s.remove_prefix(1);
  while (!s.empty() && blank(s.back())) s.remove_suffix(1);
  if (s.size() > 1 && s.front() == '+' && s[1] != '-' && s[1] != '+') s.remove_prefix(1);
  return s;
}

template <typename T>
NumberText::Result parseWhole(std::string_view text, T& out) {
  const std::string_view s = numberPart(text);
  T value{};
  const auto [end, ec] = std::from_chars(s.data(), s.data() + s.size(), value);
  if (ec == std::errc::result_out_of_range) return NumberText::Result::OutOfRange;
  if (ec != std::errc() || s.empty() || end != s.data() + s.size()) {
    return NumberText::Result::Malformed;
  }
  out = value;
  return NumberText::Result::Ok;
}

}  // namespace

NumberText::Result NumberText::parse(std::string_view text, int& out) {
  return parseWhole(text, out);
}

NumberText::Result NumberText::parse(std::string_view text, double& out) {
  double value = 0;
  const Result r = parseWhole(text, value);
  if (r != Result::Ok) return r;
  if (!std::isfinite(value)) return Result::NotFinite;
  out = value;
  return Result::Ok;
}

String NumberText::format(double value) {
  char buf[32];
  const auto [end, ec] = std::to_chars(buf, buf + sizeof buf, value);
  return ec == std::errc() ? String(buf, end) : String();
}

const char* NumberText::describe(Result result) {
  switch (result) {
    case Result::Ok:
      return "is fine";
    case Result::Malformed:
      return "is not a number";
    case Result::OutOfRange:
      return "is out of range";
    case Result::NotFinite:
      return "is not finite";
  }
  return "?";
}

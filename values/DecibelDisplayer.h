#pragma once
// A ready-made displayer for gains kept as linear amplitude factors (1.0 is unity) and shown in
// decibels: 20·log10(gain) with a chosen number of decimals and " dB" ("-6.0 dB"). A gain of 0
// (or below) shows as "-inf dB"; typing "-inf" gives 0. For float and double.
//
// Choices made here:
// - Unreadable text gives NaN, which the parser refuses, so the old gain comes back.
// - A typed level too high for the type becomes an infinite gain, which the range clamps.
#include "values/VariBoxParserBasicDisplayerBase.h"

template <typename T>
class DecibelDisplayer : public VariBoxParserBasicDisplayerBase<T> {
 public:
  explicit DecibelDisplayer(int decimals = 1, unsigned char maxNumChars = 0)
      : decimals_(decimals), maxNumChars_(maxNumChars) {}
  virtual ~DecibelDisplayer() = default;

  WString format(T gain) override;
  T parse(const WString& text) override;
  String getAllowedCharacters() override { return "0123456789-+. dBinf"; }
  unsigned char getMaxNumChars() override { return maxNumChars_; }

  static constexpr const wchar_t* kSuffix = L" dB";
  static constexpr const wchar_t* kSilence = L"-inf";

 private:
  int decimals_;
  unsigned char maxNumChars_;
};

extern template class DecibelDisplayer<float>;
extern template class DecibelDisplayer<double>;

#include "platform/misc/PrefVal.h"

#include <cmath>

#include "platform/misc/Diagnostics.h"
#include "platform/misc/EditorPreferences.h"
#include "platform/misc/NumberText.h"

namespace {

String toText(bool v) {
  return v ? "1" : "0";
}
String toText(int v) {
  return std::to_string(v);
}
String toText(double v) {
  return NumberText::format(v);
}
String toText(const String& v) {
  return v;
}

bool fromText(const String& text, bool& out) {
  if (text == "1" || text == "true") {
    out = true;
  } else if (text == "0" || text == "false") {
    out = false;
  } else {
    return false;
  }
  return true;
}
bool fromText(const String& text, int& out) {
  return NumberText::parse(text, out) == NumberText::Result::Ok;
}
bool fromText(const String& text, double& out) {
  return NumberText::parse(text, out) == NumberText::Result::Ok;
}
bool fromText(const String& text, String& out) {
  out = text;
  return true;
}

// Only finite doubles are stored: "nan" would not read back as the value that was set.
template <typename T>
bool storable(const T&) {
  return true;
}
bool storable(double v) {
  return std::isfinite(v);
}

}  // namespace

template <typename T>
EditorPreferences& PrefVal<T>::store() const {
  return store_ != nullptr ? *store_ : prefs();
}

template <typename T>
T PrefVal<T>::get() const {
  const EditorPreferences& s = store();
  if (!s.hasPreference(key_)) return default_;
  const String text = s.getPreference(key_);
  T value = default_;
  if (!fromText(text, value)) {
    diagWarning("PrefVal: preference '" + key_ + "' holds '" + text.substr(0, 80) +
                "', which is not of its type; using the default");
    return default_;
  }
  return value;
}

template <typename T>
void PrefVal<T>::set(const T& value) {
  if (!storable(value)) {
    diagWarning("PrefVal: refused a value that is not finite for '" + key_ + "'");
    return;
  }
  store().setPreference(key_, toText(value));
}

template <typename T>
void PrefVal<T>::reset() {
  store().removePreference(key_);
}

template class PrefVal<bool>;
template class PrefVal<int>;
template class PrefVal<double>;
template class PrefVal<String>;

#pragma once
// A typed preference: a key and a default, kept in the process's preferences (or a given
// store). Provided for bool, int, double and String. Stored as text: bool as "1" or "0" (when
// read, "true" and "false" are accepted too), numbers in decimal, String as it is. A stored
// text that does not parse as the type gives the default and a diagnostic; NaN and infinities
// are refused when set.
#include "platform/kw/String.h"

class EditorPreferences;

template <typename T>
class PrefVal {
 public:
  // `store` is not owned; null means prefs().
  PrefVal(String key, T def, EditorPreferences* store = nullptr)
      : key_(std::move(key)), default_(std::move(def)), store_(store) {}

  T get() const;
  operator T() const { return get(); }
  // Writes through at once (the store saves it when auto-save is on).
  void set(const T& value);
  PrefVal& operator=(const T& value) {
    set(value);
    return *this;
  }
  // Forgets the stored value, so that the default applies again.
  void reset();

  const String& key() const { return key_; }
  const T& defaultValue() const { return default_; }

 private:
  EditorPreferences& store() const;

  String key_;
  T default_;
  EditorPreferences* store_;
};

extern template class PrefVal<bool>;
extern template class PrefVal<int>;
extern template class PrefVal<double>;
extern template class PrefVal<String>;

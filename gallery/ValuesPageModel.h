#pragma once
// What the values page keeps alive beside its controls: the displayers its parsers borrow, and
// the model level that two value boxes and a meter show. Every request the level's adaptor
// hears is told to the page as a message ("level 4 change 1"), so the message log shows the
// change types of a drag between the boxes' own messages. It is an invisible child of the
// page and goes with it.
#include "foundation/ValServerAdaptor.h"
#include "platform/glob/Glob.h"
#include "values/DecibelDisplayer.h"
#include "values/DecimalDisplayer.h"
#include "values/IntegerDisplayer.h"
#include "values/PercentDisplayer.h"
#include "values/UnitDisplayer.h"

class ValuesPageModel : public Glob {
 public:
  static constexpr int kLevelMax = 10;

  explicit ValuesPageModel(Canvas* page);

  ValServer<int>& level() { return level_; }
  Kw::Ptr<ValAdaptorBase<int>> levelAdaptor() const;
  // Tells the page what the adaptor was asked.
  void noteRequest(int value, DataChangeType why);

  IntegerDisplayer<int> whole;
  IntegerDisplayer<unsigned> count;
  UnitDisplayer<int> frames{L" fr"};
  UnitDisplayer<double> seconds{L" s", 3};
  DecimalDisplayer<double> decimal{3};
  PercentDisplayer<int> percent;
  DecibelDisplayer<float> gain{1};

  const char* idstring() const override { return "valuespagemodel"; }

 private:
  class LevelAdaptor;

  ValServer<int> level_{4};
  Kw::Ptr<ValServerAdaptor<int>> adaptor_;
};

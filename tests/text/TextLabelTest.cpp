// Labels: growing to fit and never shrinking, fixed sizes, and publishing their text to a
// bound value exactly when it changes.
#include <gtest/gtest.h>

#include <memory>
#include <vector>

#include "foundation/ValServerAdaptor.h"
#include "panels/StandardPanel.h"
#include "platform/glib/FontCache.h"
#include "platform/testing/Harness.h"
#include "text/TextLabel.h"

namespace {

// Records every publication and accepts it; may delete the label while it is published.
class RecordingAdaptor : public ValAdaptorBase<WString> {
 public:
  WString getDataValue() override { return value; }
  bool requestSetNewDataValue(const WString& v, DataChangeType why) override {
    requests.push_back({v, why});
    value = v;
    if (deleteOnRequest) delete deleteOnRequest;
    return true;
  }
  struct Request {
    WString value;
    DataChangeType why;
  };
  WString value;
  std::vector<Request> requests;
  Glob* deleteOnRequest = nullptr;
};

TextLabel* labelOn(Harness& h, const WString& text) {
  return new TextLabel(text, h.root().getPalette(), 0, false, h.canvas());
}

}  // namespace

TEST(TextLabel, CalcHeightIsTheFontHeightPlusTwo) {
  EXPECT_EQ(TextLabel::calcHeight(13), 15);
  EXPECT_EQ(TextLabel::calcHeight(20), 22);
  EXPECT_EQ(TextLabel::calcHeight(0), Glib::fonts().standard()->height() + 2);
}

TEST(TextLabel, GrowsToFitAndNeverShrinks) {
  Harness h(400, 100);
  TextLabel* label = labelOn(h, L"Gain");
  const int startW = label->width();
  EXPECT_EQ(startW, label->neededWidth(L"Gain"));
  EXPECT_EQ(label->height(), TextLabel::calcHeight(0));

  const Kw::Box<int> before = label->canvas()->rect();
  label->setText(L"Gain of the second channel");
  EXPECT_EQ(label->width(), label->neededWidth(L"Gain of the second channel"));
  EXPECT_GT(label->width(), startW);
  // It grows to the right and keeps its top.
  EXPECT_EQ(label->canvas()->rect().x0, before.x0);
  EXPECT_EQ(label->canvas()->rect().y1, before.y1);

  const int wide = label->width();
  label->setText(L"G");
  EXPECT_EQ(label->width(), wide);
  EXPECT_EQ(label->getText(), L"G");
}

TEST(TextLabel, FixedSizeIsKeptWhateverTheText) {
  Harness h(400, 100);
  TextLabel* label = labelOn(h, L"Short");
  label->fixSize(30, 12);
  EXPECT_TRUE(label->isFixedSize());
  label->setText(L"A text much longer than thirty pixels");
  EXPECT_EQ(label->width(), 30);
  EXPECT_EQ(label->height(), 12);
  label->setFont(Glib::FontDesc(String(), 24));
  EXPECT_EQ(label->width(), 30);
  EXPECT_EQ(label->height(), 12);
}

TEST(TextLabel, InitRecordSizeIsAStartingSize) {
  Harness h(400, 100);
  TextLabelInitArgs args;
  args.info = h.place(10, 10, 200, 30);
  args.text = L"Fits";
  auto* roomy = new TextLabel(args);
  EXPECT_EQ(roomy->width(), 200);
  EXPECT_EQ(roomy->height(), 30);

  args.info = h.place(10, 50, 0, 0);
  auto* measured = new TextLabel(args);
  EXPECT_EQ(measured->width(), measured->neededWidth(L"Fits"));
}

TEST(TextLabel, PublishesItsTextOnlyWhenItChanges) {
  Harness h(400, 100);
  TextLabel* label = labelOn(h, L"Take 1");
  Kw::Ptr<RecordingAdaptor> adaptor(new RecordingAdaptor);
  label->setDataAdaptor(adaptor);

  label->setText(L"Take 1");
  EXPECT_TRUE(adaptor->requests.empty());
  label->setText(L"Take 2");
  ASSERT_EQ(adaptor->requests.size(), 1u);
  EXPECT_EQ(adaptor->requests[0].value, L"Take 2");
  EXPECT_EQ(adaptor->requests[0].why, 4);
  label->setString(L"Take 2");
  EXPECT_EQ(adaptor->requests.size(), 1u);

  // The model speaking is shown, never echoed.
  adaptor->setNewWidgetValue(L"Take 3 from the model");
  EXPECT_EQ(label->getText(), L"Take 3 from the model");
  EXPECT_EQ(label->width(), label->neededWidth(L"Take 3 from the model"));
  EXPECT_EQ(adaptor->requests.size(), 1u);
}

TEST(TextLabel, LabelsBoundToOneValueShowItTogether) {
  Harness h(400, 100);
  ValServer<WString> model(L"Bar 1");
  Kw::Ptr<ValServerAdaptor<WString>> adaptor(new ValServerAdaptor<WString>(&model));
  TextLabel* a = labelOn(h, L"");
  TextLabel* b = labelOn(h, L"");
  a->setDataAdaptor(adaptor);
  b->setDataAdaptor(adaptor);
  adaptor->forceWidgetUpdate();
  EXPECT_EQ(a->getText(), L"Bar 1");

  a->setText(L"Bar 2");
  EXPECT_EQ(model.getValue(), L"Bar 2");
  EXPECT_EQ(b->getText(), L"Bar 2");
  model.setValue(L"Bar 3");
  EXPECT_EQ(a->getText(), L"Bar 3");
  EXPECT_EQ(b->getText(), L"Bar 3");
}

TEST(TextLabel, AnAdaptorMayDeleteTheLabelItHears) {
  Harness h(400, 100);
  TextLabel* label = labelOn(h, L"Doomed");
  GlobHandle<TextLabel> alive(label);
  Kw::Ptr<RecordingAdaptor> adaptor(new RecordingAdaptor);
  label->setDataAdaptor(adaptor);
  adaptor->deleteOnRequest = label;
  label->setText(L"Gone");
  EXPECT_FALSE(alive);
  EXPECT_EQ(adaptor->value, L"Gone");
}

TEST(TextLabel, APanelPlacesAGrownLabelAgain) {
  Harness h(400, 200);
  auto* panel = new StandardPanel(h.place(0, 0, 300, 150));
  auto* label = new TextLabel(L"Level", panel->getPalette(), 0, false, panel->canvas());
  panel->addWidget(label, 10, 10, OriginTopRight);
  EXPECT_EQ(label->canvas()->rect().x1, 290);
  label->setText(L"Level of the left channel");
  EXPECT_EQ(label->canvas()->rect().x1, 290);
  EXPECT_EQ(label->canvas()->rect().y1, 140);
}

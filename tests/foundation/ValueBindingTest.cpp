#include <gtest/gtest.h>

#include <memory>

#include "foundation/ButtonWidget.h"
#include "foundation/ColourComponentAdaptor.h"
#include "foundation/ListViewAdaptorBase.h"
#include "foundation/ListViewWidget.h"
#include "foundation/ValServerAdaptor.h"
#include "foundation/ValWidget.h"
#include "platform/glob/GlobHandle.h"
#include "platform/testing/Harness.h"

namespace {

// A control that shows an int; a left press asks for one more.
class IntBox : public Glob, public ValWidget<int> {
 public:
  explicit IntBox(const GlobCreationInfo& info) : Glob(info) {}

  int getWidgetValue() override { return shown; }
  void setNewWidgetValue(int& v) override {
    ++pushes;
    if (v == shown) return;
    shown = v;
    update();
  }
  void setEnabledState(bool enabled) override { setActive(enabled, true); }
  int react(Event* e) override {
    if (mouse_left_event(e) && mouse_down_event(e)) {
      const int wanted = shown + 1;
      lastAccepted = requestSetNewDataValue(wanted, kChangeDirect);
      return 1;
    }
    return Glob::react(e);
  }

  int shown = 0;
  int pushes = 0;
  bool lastAccepted = false;
};

// A text field for one colour component.
class TextField : public Glob, public ValWidget<String> {
 public:
  explicit TextField(const GlobCreationInfo& info) : Glob(info) {}
  String getWidgetValue() override { return text; }
  void setNewWidgetValue(String& v) override { text = v; }
  bool commit(const String& typed) {
    text = typed;
    return requestSetNewDataValue(typed, kChangeDirect);
  }
  String text;
};

// An adaptor over a plain int that notes how it was called.
class NotingAdaptor : public ValAdaptorBase<int> {
 public:
  int getDataValue() override { return value; }
  bool requestSetNewDataValue(const int& v, DataChangeType why) override {
    redrawsHeldDuringRequest = !Drawable::redrawsEnabled();
    lastWhy = why;
    if (v > limit) return false;
    value = v;
    setNewWidgetValue(v);
    return true;
  }
  void handleMsgForParent(String msg) override { forwarded = msg; }

  int value = 0;
  int limit = 100;
  bool redrawsHeldDuringRequest = false;
  DataChangeType lastWhy = kChangeDragStart;
  String forwarded;
};

class ListBox : public Glob, public ListViewWidget {
 public:
  explicit ListBox(const GlobCreationInfo& info) : Glob(info) {}
  void addItemText(unsigned i) override { log.push_back("add " + std::to_string(i)); }
  void removeItemText(unsigned i) override { log.push_back("del " + std::to_string(i)); }
  void itemChanged(unsigned i) override { log.push_back("upd " + std::to_string(i)); }
  void setCurrentItem(unsigned i) override { current = i; }
  std::vector<String> log;
  unsigned current = 0xFFFFFFFF;
};

}  // namespace

TEST(ValueBinding, UnboundControlKeepsEditsToItself) {
  Harness h;
  IntBox box(h.place(0, 0, 20, 20));
  EXPECT_TRUE(box.requestSetNewDataValue(42, kChangeDirect));
  EXPECT_EQ(box.getDataValue(), 0);
  EXPECT_EQ(box.getDataAdaptor(), nullptr);
  box.handleMsgForParent("nobody listens");  // no adaptor: nothing happens
  EXPECT_TRUE(Drawable::redrawsEnabled());
}

TEST(ValueBinding, OneServerDrivesSeveralControls) {
  Harness h;
  ValServer<int> model(3);
  Kw::Ptr<ValServerAdaptor<int>> adaptor(new ValServerAdaptor<int>(&model));
  IntBox a(h.place(0, 0, 20, 20));
  auto b = std::make_unique<IntBox>(h.place(40, 0, 20, 20));
  a.setDataAdaptor(adaptor);
  b->setDataAdaptor(adaptor);
  adaptor->forceWidgetUpdate();
  EXPECT_EQ(a.shown, 3);
  EXPECT_EQ(b->shown, 3);

  // A click on one control edits the model, which brings the value to both.
  h.clickOn(a);
  EXPECT_TRUE(a.lastAccepted);
  EXPECT_EQ(model.getValue(), 4);
  EXPECT_EQ(a.shown, 4);
  EXPECT_EQ(b->shown, 4);
  EXPECT_EQ(a.getDataValue(), 4);

  // The model changed elsewhere reaches both, and an equal value reaches no one.
  model.setValue(10);
  EXPECT_EQ(b->shown, 10);
  const int pushes = a.pushes;
  model.setValue(10);
  EXPECT_EQ(a.pushes, pushes);

  // Destroying one leaves the other bound.
  b.reset();
  EXPECT_EQ(adaptor->numAttached(), 1u);
  h.clickOn(a);
  EXPECT_EQ(model.getValue(), 11);
  EXPECT_EQ(a.shown, 11);

  adaptor->setWidgetEnabledState(false);
  EXPECT_FALSE(a.isActive());
}

TEST(ValueBinding, RequestsRunWithRedrawsHeldAndCarryTheirReason) {
  Harness h;
  Kw::Ptr<NotingAdaptor> adaptor(new NotingAdaptor);
  IntBox box(h.place(0, 0, 20, 20));
  box.setDataAdaptor(adaptor);
  EXPECT_TRUE(box.requestSetNewDataValue(7, kChangeDragStep));
  EXPECT_TRUE(adaptor->redrawsHeldDuringRequest);
  EXPECT_TRUE(Drawable::redrawsEnabled());
  EXPECT_EQ(adaptor->lastWhy, kChangeDragStep);
  EXPECT_EQ(box.shown, 7);

  // A refused value leaves model and control alone.
  EXPECT_FALSE(box.requestSetNewDataValue(500, kChangeDirect));
  EXPECT_EQ(adaptor->value, 7);
  EXPECT_EQ(box.shown, 7);

  box.handleMsgForParent("hello");
  EXPECT_EQ(adaptor->forwarded, "hello");
}

TEST(ValueBinding, ReboundWithoutDetachingStaysOnBothAdaptorsSafely) {
  Harness h;
  Kw::Ptr<NotingAdaptor> first(new NotingAdaptor);
  Kw::Ptr<NotingAdaptor> second(new NotingAdaptor);
  auto box = std::make_unique<IntBox>(h.place(0, 0, 20, 20));
  box->setDataAdaptor(first);
  box->setDataAdaptor(second);
  // The held adaptor is the new one, but the old one still drives the control.
  EXPECT_EQ(box->getDataAdaptor(), Kw::Ptr<ValAdaptorBase<int>>(second));
  EXPECT_TRUE(first->isAttached(box.get()));
  first->setNewWidgetValue(5);
  EXPECT_EQ(box->shown, 5);

  // Destroying the control takes it out of both sets.
  box.reset();
  EXPECT_EQ(first->numAttached(), 0u);
  EXPECT_EQ(second->numAttached(), 0u);
  first->setNewWidgetValue(6);

  // Detaching first, as re-binding code should, leaves only the new adaptor driving it.
  IntBox other(h.place(0, 0, 20, 20));
  other.setDataAdaptor(first);
  first->detachFrom(&other);
  other.setDataAdaptor(second);
  first->setNewWidgetValue(9);
  EXPECT_NE(other.shown, 9);

  // An old adaptor that dies while the control lives is forgotten by it.
  other.setDataAdaptor(first);
  other.setDataAdaptor(second);
  first.reset();
  second->setNewWidgetValue(2);
  EXPECT_EQ(other.shown, 2);
}

TEST(ValueBinding, ModelDestroyedUnderABoundControl) {
  Harness h;
  auto model = std::make_unique<ValServer<int>>(8);
  Kw::Ptr<ValServerAdaptor<int>> adaptor(new ValServerAdaptor<int>(model.get()));
  IntBox box(h.place(0, 0, 20, 20));
  box.setDataAdaptor(adaptor);
  adaptor->forceWidgetUpdate();

  model.reset();
  // The control keeps the last value, is disabled, and its edits are refused.
  EXPECT_FALSE(box.isActive());
  EXPECT_EQ(box.getDataValue(), 8);
  EXPECT_EQ(adaptor->server(), nullptr);
  EXPECT_FALSE(box.requestSetNewDataValue(9, kChangeDirect));
  EXPECT_EQ(box.getDataValue(), 8);
  EXPECT_EQ(Kw::Ptr<ValServerAdaptor<int>>(new ValServerAdaptor<int>(nullptr))->getDataValue(), 0);
}

TEST(ValueBinding, PushSurvivesAControlDeletingAnother) {
  // One control's display deletes a sibling bound to the same adaptor before its turn.
  struct Killer : IntBox {
    using IntBox::IntBox;
    void setNewWidgetValue(int& v) override {
      IntBox::setNewWidgetValue(v);
      victim.reset();
    }
    std::unique_ptr<IntBox> victim;
  };
  Harness h;
  Kw::Ptr<NotingAdaptor> adaptor(new NotingAdaptor);
  // Made in both orders so that the victim comes after the killer in one of the two sets.
  for (int round = 0; round < 2; ++round) {
    auto first = std::make_unique<IntBox>(h.place(0, 0, 10, 10));
    auto killer = std::make_unique<Killer>(h.place(20, 0, 10, 10));
    killer->victim =
        round == 0 ? std::move(first) : std::make_unique<IntBox>(h.place(40, 0, 10, 10));
    killer->setDataAdaptor(adaptor);
    killer->victim->setDataAdaptor(adaptor);
    adaptor->setNewWidgetValue(round + 1);
    EXPECT_EQ(killer->victim, nullptr);
    EXPECT_EQ(adaptor->numAttached(), 1u);
    adaptor->detachFrom(killer.get());
  }
}

TEST(ButtonBinding, PlainButtonAdaptorRefusesAndConsumesNothing) {
  Kw::Ptr<ButtonAdaptor<WString>> plain(new ButtonAdaptor<WString>);
  EXPECT_EQ(plain->getDataValue(), L"");
  EXPECT_FALSE(plain->requestSetNewDataValue(L"x", kChangeDirect));
  EXPECT_EQ(plain->messageReceived("anything"), kEventNotConsumed);
}

TEST(ColourComponent, ShowsOneComponentAsText) {
  EXPECT_EQ(ColourComponentAdaptor(0, ColourSpaceRGB, nullptr).getDataValue(), "---");

  ValServer<ColourData> colour(ColourData(1.0, 0.5, 0.0, 0.2));
  EXPECT_EQ(ColourComponentAdaptor(0, ColourSpaceRGB, &colour).getDataValue(), "255");
  EXPECT_EQ(ColourComponentAdaptor(1, ColourSpaceRGB, &colour).getDataValue(), "128");
  EXPECT_EQ(ColourComponentAdaptor(2, ColourSpaceRGB, &colour).getDataValue(), "0");
  EXPECT_EQ(ColourComponentAdaptor(3, ColourSpaceRGB, &colour).getDataValue(), "51");
  EXPECT_EQ(ColourComponentAdaptor(7, ColourSpaceRGB, &colour).getDataValue(), "0");
  // Hue of orange is 30 degrees: 255/12 rounds to 21.
  EXPECT_EQ(ColourComponentAdaptor(0, ColourSpaceHSV, &colour).getDataValue(), "21");
  // The decimal space shows three decimals: luma of (1, 0.5, 0).
  EXPECT_EQ(ColourComponentAdaptor(0, ColourSpaceYCbCr, &colour).getDataValue(), "0.570");
  EXPECT_EQ(colour.getValue().getColourSpace(), ColourSpaceRGB);  // the model is not converted
}

TEST(ColourComponent, TypedTextGoesBackIntoTheModel) {
  Harness h;
  ValServer<ColourData> colour(ColourData(0.0, 0.0, 0.0));
  Kw::Ptr<ColourComponentAdaptor> red(new ColourComponentAdaptor(0, ColourSpaceRGB, &colour));
  Kw::Ptr<ColourComponentAdaptor> luma(new ColourComponentAdaptor(0, ColourSpaceYCbCr, &colour));
  TextField redField(h.place(0, 0, 40, 20));
  TextField lumaField(h.place(0, 30, 40, 20));
  redField.setDataAdaptor(red);
  lumaField.setDataAdaptor(luma);

  EXPECT_TRUE(redField.commit(" 255 "));
  EXPECT_DOUBLE_EQ(colour.getValue().getComp1(), 1.0);
  // Every field on the model follows, in its own space and format.
  EXPECT_EQ(redField.text, "255");
  EXPECT_EQ(lumaField.text, "0.213");

  const ColourData before = colour.getValue();
  for (const char* bad : {"", "abc", "12x", "256", "-1", "1.5", "nan"}) {
    EXPECT_FALSE(redField.commit(bad)) << bad;
    EXPECT_EQ(redField.text, "255") << bad;  // the model's text is put back
  }
  for (const char* bad : {"1.01", "-0.2", "inf", "1e999"})
    EXPECT_FALSE(lumaField.commit(bad)) << bad;
  EXPECT_EQ(colour.getValue(), before);

  colour.setValue(ColourData(0.2, 0.2, 0.2));
  EXPECT_EQ(lumaField.text, "0.200");
  EXPECT_TRUE(lumaField.commit("0.5"));
  EXPECT_EQ(colour.getValue(), ColourData(0.5, 0.5, 0.5));
  EXPECT_EQ(redField.text, "128");

  // A model held in another space stays in it.
  ValServer<ColourData> hsv(ColourData(0.0, 1.0, 1.0, 1.0, ColourSpaceHSV));
  Kw::Ptr<ColourComponentAdaptor> green(new ColourComponentAdaptor(1, ColourSpaceRGB, &hsv));
  EXPECT_TRUE(green->requestSetNewDataValue("255", kChangeDirect));
  EXPECT_EQ(hsv.getValue().getColourSpace(), ColourSpaceHSV);
  EXPECT_NEAR(hsv.getValue().getComp1(), 1.0 / 6, 1e-9);  // red + green = yellow

  // Without a model every request is refused.
  EXPECT_FALSE(ColourComponentAdaptor(0, ColourSpaceRGB, nullptr)
                   .requestSetNewDataValue("1", kChangeDirect));
}

TEST(ListBinding, ListAndCurrentIndexReachTheControl) {
  Harness h;
  auto items = std::make_unique<ListServer>();
  ValServer<unsigned int> current(0);
  items->addItem(L"one");
  Kw::Ptr<ListViewAdaptorBase> adaptor(new ListViewAdaptorBase(items.get(), &current));
  ListBox box(h.place(0, 0, 50, 50));
  box.setDataAdaptor(adaptor);

  items->addItem(L"two");
  items->setItem(0, L"uno");
  items->removeItem(1);
  EXPECT_EQ(box.log, (std::vector<String>{"add 1", "upd 0", "del 1"}));
  EXPECT_EQ(box.getSize(), 1u);
  EXPECT_EQ(box[0], L"uno");
  EXPECT_EQ(box[5], L"");

  items->addItem(L"dos");
  EXPECT_TRUE(box.requestItemSelect(1));
  EXPECT_EQ(current.getValue(), 1u);
  EXPECT_EQ(box.current, 1u);
  EXPECT_FALSE(box.requestItemSelect(2));
  EXPECT_EQ(current.getValue(), 1u);

  items.reset();
  EXPECT_EQ(box.getSize(), 0u);
  EXPECT_FALSE(box.requestItemSelect(0));
}

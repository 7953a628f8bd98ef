#pragma once
// Shows one component of a model colour as text, for a text control, and writes typed text
// back into that component.
//
// Reading: "---" with no colour server; otherwise the component after converting the colour
// into the adaptor's space: in the decimal space (ColourData::isDecimalSpace) formatted with
// three decimals, elsewhere as the integer value x 255 rounded.
// Writing: the text must be a whole number in the integer spaces (0..255, surrounding spaces
// allowed) or a decimal number in the decimal space, within the component's range. Anything
// else is refused: the model keeps its colour and the controls are given its text again. An
// accepted value is set in the adaptor's space and the colour is converted back to the space the
// server holds it in.
#include "foundation/ValAdaptorBase.h"
#include "platform/misc/ColourData.h"
#include "platform/misc/ValClient.h"

class ColourComponentAdaptor : public ValAdaptorBase<String>, public ValClient<ColourData> {
 public:
  // `component`: 0..2 the colour components, 3 alpha; any other index reads 0.0.
  ColourComponentAdaptor(int component, ColourSpace space, ValServer<ColourData>* server);

  String getDataValue() override;
  bool requestSetNewDataValue(const String& value, DataChangeType why) override;
  void valChangedNtfy() override;

  // The component value `text` stands for, or false when it is refused.
  bool parse(const String& text, double* value) const;

 private:
  int component_;
  ColourSpace space_;
};

#include "foundation/ButtonWidget.h"

template class ButtonWidget<String>;
template class ButtonWidget<WString>;

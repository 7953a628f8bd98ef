#include "foundation/ButtonAdaptor.h"

template class ButtonAdaptor<String>;
template class ButtonAdaptor<WString>;

#include "platform/glob/CanvasClient.h"

#include "platform/glob/Glob.h"

double CanvasClient::width() {
  Glob* g = asGlob();
  return g ? g->canvas()->width() : 0.0;
}

double CanvasClient::height() {
  Glob* g = asGlob();
  return g ? g->canvas()->height() : 0.0;
}

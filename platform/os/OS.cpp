#include "platform/os/OS.h"

OSService* OS() {
  static OSService service;
  return &service;
}

#include "gateway/core/log.h"

#ifndef QUORVANE_NO_LOG

#include <android/log.h>

void debuglog(const char* text) {
  __android_log_write(ANDROID_LOG_DEBUG, "gatewayjni", text == nullptr ? "" : text);
}

#endif

// The local time as text, shared by the net reports and the training log (internal).
#ifndef TONVEX_NNET_LOCALTIME_H
#define TONVEX_NNET_LOCALTIME_H

#include <string>

/// asctime(localtime(time)): the fixed 24-character form followed by a newline, for
/// example "Tue Jun  4 09:05:00 2024\n"; empty when the local time is unavailable.
std::string LocalTimeText();

#endif

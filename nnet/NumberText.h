// Numbers in the net's messages, written alike in every locale (internal): a host may
// have switched the process to one with a decimal comma.
#ifndef TONVEX_NNET_NUMBERTEXT_H
#define TONVEX_NNET_NUMBERTEXT_H

#include <string>

/// The value as printf's "%f" writes it in the C locale: six decimals after a point.
std::string FixedText(double value);

#endif

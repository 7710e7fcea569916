#include "nnet/LocalTime.h"

#include <ctime>

std::string LocalTimeText() {
  const std::time_t now = std::time(nullptr);
  std::tm const* local = std::localtime(&now);
  if (local == nullptr) return std::string();
  return std::asctime(local);
}

// The longest array the host makes, for every array class.
#pragma once

#include <stdexcept>
#include <string>

namespace standin {

constexpr unsigned int kMaxArrayLength = 1u << 28;

// `length`, or std::length_error when it is above the maximum.
inline unsigned int checkedLength(unsigned int length) {
  if (length > kMaxArrayLength)
    throw std::length_error("an array of " + std::to_string(length) +
                            " elements is longer than the host allows");
  return length;
}

}  // namespace standin

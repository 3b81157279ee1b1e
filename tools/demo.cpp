#include <zebmediatypes/zebmediatypes.h>

#include <iostream>

int main() {
  std::cout << "zebmediatypes demo\n";
  return 0;
}

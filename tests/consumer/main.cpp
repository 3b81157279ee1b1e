// Uses the installed library through its umbrella header only.
#include <zebmediatypes/zebmediatypes.h>

#include <iostream>

int main() {
  std::cout << "consumer: built against the installed zebmediatypes\n";
  return 0;
}

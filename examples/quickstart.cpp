// The smallest useful tovrin program: numbers in, exact text out, a clear error on bad input.
#include <iostream>

#include <tovrin/tovrin.h>

int main() {
  using namespace tovrin;
  const TQENFloatVector samples{2.5L, 3.25L, 4.0L};
  Extended sum = 0;
  for (Extended x : samples) sum += x;
  std::cout << "sum  " << Float2EStr(sum, 2) << '\n';                // 9.75
  std::cout << "0.1L " << Float2EStr(Str2Float("0.1"), 21) << '\n';  // the stored binary value
  try {
    Str2Float("1,5");
  } catch (const EConvertError& e) {
    std::cout << "error " << e.what() << '\n';
  }
  return 0;
}

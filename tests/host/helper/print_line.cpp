// Writes lines through liblog: print_line PRIORITY TAG TEXT [COPIES THREADS]. A text of "(null)" is
// a null one. The environment decides what is seen; the exit status tells what liblog answered.
#include <android/log.h>
#include <errno.h>

#include <cstdlib>
#include <string>
#include <thread>
#include <vector>

int main(int argc, char** argv) {
  if (argc < 4) return 2;
  const int priority = std::atoi(argv[1]);
  const char* tag = std::string(argv[2]) == "(null)" ? nullptr : argv[2];
  const char* text = std::string(argv[3]) == "(null)" ? nullptr : argv[3];
  if (argc < 6) return __android_log_write(priority, tag, text) == 1 ? 0 : 1;

  const int copies = std::atoi(argv[4]);
  std::vector<std::thread> threads;
  for (int i = std::atoi(argv[5]); i > 0; --i) {
    threads.emplace_back([=] {
      for (int n = 0; n < copies; ++n) (void)__android_log_write(priority, tag, text);
    });
  }
  for (std::thread& thread : threads) thread.join();
  return 0;
}

#include <csignal>
#include <exception>
#include <iostream>

#include "cli/command_line.h"
#include "cli/console.h"

int main(int argc, char** argv) {
  std::signal(SIGPIPE, SIG_IGN);
  std::signal(SIGXFSZ, SIG_IGN);
  std::ios::sync_with_stdio(false);
  try {
    const int status = gridbay::cli::runCommandLine(argc, argv, std::cout, std::cerr);
    std::cout.flush();
    return std::cout ? status : gridbay::cli::kCouldNotDoIt;
  } catch (const std::bad_alloc&) {
    std::cerr << "There is not enough memory for this\n";
  } catch (const std::exception& error) {
    std::cerr << "Unexpected error: " << error.what() << '\n';
  }
  return gridbay::cli::kCouldNotDoIt;
}

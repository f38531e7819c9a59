#include "zornet/picture.h"

#include <fcntl.h>
#include <fmt/core.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <csignal>
#include <cstring>
#include <fstream>
#include <iostream>
#include <stdexcept>
#include <string_view>

extern char** environ;

namespace zornet {

namespace {

[[noreturn]] void Fail(const std::string& what, int error) {
  throw std::runtime_error(fmt::format("{}: {}", what, std::strerror(error)));
}

// A pipe whose ends close with it.
struct Pipe {
  Pipe() {
    if (pipe2(ends, O_CLOEXEC) != 0) Fail("pipe", errno);
  }
  ~Pipe() {
    for (const int end : ends) {
      if (end >= 0) close(end);
    }
  }
  Pipe(const Pipe&) = delete;
  Pipe& operator=(const Pipe&) = delete;

  int ends[2] = {-1, -1};
};

// The graph goes in through a pipe, so that no temporary file can be left behind.
pid_t StartDot(const std::string& file, const Pipe& input) {
  posix_spawn_file_actions_t actions;
  posix_spawn_file_actions_init(&actions);
  posix_spawn_file_actions_adddup2(&actions, input.ends[0], STDIN_FILENO);
  std::string program = "dot", format = "-Tsvg", output = "-o" + file;
  char* const arguments[] = {program.data(), format.data(), file == "-" ? nullptr : output.data(), nullptr};
  pid_t child = 0;
  const int error = posix_spawnp(&child, "dot", &actions, nullptr, arguments, environ);
  posix_spawn_file_actions_destroy(&actions);
  if (error != 0) Fail("dot, which draws pictures (package graphviz)", error);
  return child;
}

// Who reads may end early; that is told by its status and must not end this program.
void Feed(Pipe& input, std::string_view graph) {
  auto* const before = std::signal(SIGPIPE, SIG_IGN);
  close(input.ends[0]);
  input.ends[0] = -1;
  while (!graph.empty()) {
    const ssize_t written = write(input.ends[1], graph.data(), graph.size());
    if (written < 0 && errno == EINTR) continue;
    if (written <= 0) break;
    graph.remove_prefix(static_cast<std::size_t>(written));
  }
  close(input.ends[1]);
  input.ends[1] = -1;
  std::signal(SIGPIPE, before);
}

}  // namespace

void WriteGraph(const std::string& file, const std::string& graph) {
  if (file == "-") {
    std::cout << graph;
    return;
  }
  std::ofstream out(file);
  out << graph;
  out.close();
  if (!out) Fail(file, errno);
}

void WritePicture(const std::string& file, const std::string& graph) {
  std::cout.flush();
  Pipe input;
  const pid_t child = StartDot(file, input);
  Feed(input, graph);
  int status = 0;
  while (waitpid(child, &status, 0) < 0 && errno == EINTR) {
  }
  if (status != 0) throw std::runtime_error(file + ": dot could not draw it");
}

}  // namespace zornet

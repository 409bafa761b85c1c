// What a command leaves behind when the application is killed.
#include "command.h"

#include <gtest/gtest.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>
#include <filesystem>
#include <fstream>

namespace factory_test {
namespace {

TEST(CommandTest, EndsWithAllThatItStartedWhenTheApplicationIsKilled) {
  const std::string pipe = testing::TempDir() + "command_test." + std::to_string(getpid());
  ASSERT_EQ(mkfifo(pipe.c_str(), 0600), 0);
  const pid_t application = fork();
  if (application == 0) {
    const Command command("exec 3>'" + pipe + "'; sleep 1000 & echo up >&3; sleep 1000");
    for (;;) pause();
  }
  std::ifstream reader(pipe);
  std::string word;
  reader >> word;
  EXPECT_EQ(word, "up");
  kill(application, SIGKILL);
  waitpid(application, nullptr, 0);
  // The pipe ends once nobody is left who could write into it.
  EXPECT_FALSE(reader >> word);
  std::filesystem::remove(pipe);
}

}  // namespace
}  // namespace factory_test

// What a command says, and what it leaves behind.
#include "command.h"

#include <gtest/gtest.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>
#include <filesystem>
#include <fstream>

#include "support/eventually.h"

namespace factory_test {
namespace {

// What it writes until it has said how it ended.
std::string outputOf(Command& command, const std::string& outcome) {
  std::string output;
  std::optional<std::string> said;
  EXPECT_TRUE(brimol::test::eventually([&] {
    output += command.read();
    return (said = command.outcome()).has_value();
  }));
  EXPECT_EQ(said, outcome);
  return output;
}

TEST(CommandTest, SaysHowItEndedWithAllThatItWrote) {
  Command zeros("head -c 300000 /dev/zero; exit 3");
  EXPECT_EQ(outputOf(zeros, "exit code 3").size(), 300'000U);
  for (const std::string left : {"sleep 1000", "yes"}) {
    Command leaver("x=$(setsid sh -c '" + left + " >&2 & echo $!'); echo $x");
    const std::string output = outputOf(leaver, "exit code 0");
    kill(std::stoi(output.substr(output.find_first_of("123456789"))), SIGKILL);
  }
  const auto former = std::signal(SIGCHLD, SIG_IGN);
  Command unheard("exit 3");
  outputOf(unheard, "exit code unknown");
  (void)std::signal(SIGCHLD, former);
}

TEST(CommandTest, EndsAProgramThatLeavesItsGroup) {
  std::string number;
  {
    Command command("exec setsid sh -c 'echo $$; exec sleep 1000'");
    ASSERT_TRUE(brimol::test::eventually([&] { return !(number += command.read()).empty(); }));
  }
  EXPECT_NE(kill(std::stoi(number), 0), 0);
}

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

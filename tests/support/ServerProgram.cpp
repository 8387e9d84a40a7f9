#include "support/ServerProgram.h"

#include <fcntl.h>
#include <poll.h>
#include <sys/prctl.h>
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>

namespace TestSupport {
namespace {

constexpr int patienceInMilliseconds = 30000;

[[noreturn]] void become(std::vector<std::string>& arguments) {
    prctl(PR_SET_PDEATHSIG, SIGTERM);
    int const nowhere = open("/dev/null", O_RDWR);
    for (int const descriptor : {STDIN_FILENO, STDOUT_FILENO, STDERR_FILENO})
        dup2(nowhere, descriptor);
    std::vector<char*> pointers;
    for (std::string& argument : arguments)
        pointers.push_back(argument.data());
    pointers.push_back(nullptr);
    execvp(pointers.front(), pointers.data());
    _exit(127);
}

// Empty where the other side goes without a whole line, or takes too long.
std::string readLine(int descriptor) {
    std::string line;
    pollfd wait = {descriptor, POLLIN, 0};
    char c = 0;
    while (poll(&wait, 1, patienceInMilliseconds) > 0 && read(descriptor, &c, 1) == 1) {
        if (c == '\n')
            return line;
        line += c;
    }
    return std::string();
}

} // namespace

CServerProgram::CServerProgram(std::vector<std::string> arguments) : program_(arguments.front()) {
    int ends[2];
    if (pipe(ends) != 0)
        return;
    for (std::string& argument : arguments)
        if (std::size_t const place = argument.find("{}"); place != std::string::npos)
            argument.replace(place, 2, std::to_string(ends[1]));
    process_ = fork();
    if (process_ == 0) {
        close(ends[0]);
        become(arguments);
    }
    close(ends[1]);
    if (process_ > 0)
        line_ = readLine(ends[0]);
    close(ends[0]);
}

CServerProgram::~CServerProgram() {
    if (process_ <= 0)
        return;
    kill(process_, SIGTERM);
    waitpid(process_, nullptr, 0);
}

} // namespace TestSupport

#include "bench/child.h"

#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <climits>
#include <fstream>
#include <sstream>
#include <stdexcept>

namespace bench {
namespace {

/// A line such as "VmRSS:     1234 kB" of what the kernel tells of this process, in bytes.
std::size_t status(const std::string& key) {
    std::ifstream file("/proc/self/status");
    for (std::string line; std::getline(file, line);) {
        if (line.compare(0, key.size() + 1, key + ":") != 0) continue;
        return std::stoul(line.substr(key.size() + 1)) * 1024;
    }
    throw std::runtime_error("the kernel does not tell " + key);
}

[[noreturn]] void become(const std::vector<std::string>& command, int output) {
    std::vector<char*> arguments;
    arguments.reserve(command.size() + 1);
    for (const std::string& one : command) arguments.push_back(const_cast<char*>(one.c_str()));
    arguments.push_back(nullptr);
    ::dup2(output, STDOUT_FILENO);
    ::execv(arguments[0], arguments.data());
    ::_exit(127);
}

std::string read_all(int input) {
    std::string text;
    std::array<char, 512> part{};
    for (ssize_t size = 0; (size = ::read(input, part.data(), part.size())) != 0;) {
        if (size > 0) text.append(part.data(), static_cast<std::size_t>(size));
        if (size < 0 && errno != EINTR) break;
    }
    return text;
}

}  // namespace

std::string output_of(const std::vector<std::string>& command) {
    std::array<int, 2> ends{};
    if (::pipe(ends.data()) != 0) throw std::runtime_error("no pipe");
    const pid_t child = ::fork();
    if (child == 0) become(command, ends[1]);
    ::close(ends[1]);
    std::string text = child > 0 ? read_all(ends[0]) : "";
    ::close(ends[0]);
    int result = -1;
    if (child < 0 || ::waitpid(child, &result, 0) != child || result != 0) {
        throw std::runtime_error(command[0] + " failed");
    }
    while (!text.empty() && text.back() == '\n') text.pop_back();
    return text.substr(text.rfind('\n') + 1);
}

std::string own_path() {
    std::array<char, PATH_MAX> path{};
    const ssize_t size = ::readlink("/proc/self/exe", path.data(), path.size());
    if (size < 0) throw std::runtime_error("this program does not know its place");
    return {path.data(), static_cast<std::size_t>(size)};
}

std::size_t peak_memory(contender& task, const document& input) {
    task.prepare(input);
    std::ofstream("/proc/self/clear_refs") << "5";  // Sets VmHWM back to VmRSS.
    const std::size_t before = status("VmRSS");
    task.run(input);
    const std::size_t peak = status("VmHWM");
    task.finish(input);
    return peak - before;
}

}  // namespace bench

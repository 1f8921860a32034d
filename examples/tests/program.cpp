#include "program.hpp"

#include <sys/wait.h>

#include <cstdlib>
#include <fstream>
#include <iterator>

namespace example
{

namespace fs = std::filesystem;

Program::Program()
{
    const auto* const test = ::testing::UnitTest::GetInstance()->current_test_info();
    folder = fs::path(::testing::TempDir()) / (std::string("pyxcc_example_") + test->test_suite_name() + test->name());
    fs::remove_all(folder);
    fs::create_directories(folder);
    fs::create_directory_symlink(PROGRAMS, folder / "bin");
}

Program::~Program() { fs::remove_all(folder); }

std::string Program::run(const std::string& command)
{
    const std::string line = "cd '" + folder.string() + "' && { " + command + "; } > out 2> err";
    const int result = std::system(line.c_str());
    status = WIFEXITED(result) ? WEXITSTATUS(result) : -1;
    errors = readFile("err");
    return readFile("out");
}

void Program::writeFile(const std::string& name, const std::string& bytes) const
{
    std::ofstream(folder / name, std::ios::binary) << bytes;
}

std::string Program::readFile(const std::string& name) const
{
    std::ifstream file(folder / name, std::ios::binary);
    return {std::istreambuf_iterator<char>(file), {}};
}

} // namespace example

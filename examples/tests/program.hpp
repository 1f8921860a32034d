// An example run as a user would run it, in a folder of its own.
#pragma once

#include <gtest/gtest.h>

#include <filesystem>
#include <string>

namespace example
{

class Program : public ::testing::Test
{
protected:
    Program();
    ~Program() override;

    /// What a command line of the shell prints to the standard output; its exit status is `status`, and what it prints
    /// to the standard error is `errors`. `bin/` holds the programs.
    std::string run(const std::string& command);

    void writeFile(const std::string& name, const std::string& bytes) const;
    std::string readFile(const std::string& name) const;

    int status = -1;
    std::string errors;

    std::filesystem::path folder;
};

} // namespace example

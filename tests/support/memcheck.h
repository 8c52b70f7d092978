// The blocks that an action leaves allocated, as memory checking reports them.
#ifndef MEMCHECK_H
#define MEMCHECK_H

#include "qvsmemory.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <sstream>
#include <string>
#include <vector>

namespace memcheck {

struct Reported {
    std::string file; // of the source that asked for the block
    int line = 0;     // in it
    int size = 0;     // bytes
};

template <class Action>
std::vector<Reported> reportedBy(Action action)
{
    testing::internal::CaptureStdout();
    qvsMemStartMemCheck();
    action();
    qvsMemEndMemCheck();
    std::istringstream report(testing::internal::GetCapturedStdout());
    std::vector<Reported> blocks;
    for (std::string text; std::getline(report, text);) {
        char file[200] = "";
        Reported block;
        EXPECT_EQ(std::sscanf(text.c_str(), "[syncml] MEMCHECK Filename:%199s Line:%d Size:%d",
                              file, &block.line, &block.size),
                  3)
            << text;
        block.file = file;
        blocks.push_back(block);
    }
    return blocks;
}

// The sources alone.
template <class Action>
std::vector<std::string> filesOf(Action action)
{
    std::vector<std::string> files;
    for (const Reported &block : reportedBy(action)) {
        files.push_back(block.file);
    }
    return files;
}

} // namespace memcheck

#endif

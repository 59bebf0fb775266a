#include "platform/plt_Process.h"
#include "tools/Program.h"

int main(int argc, char** argv) {
    std::vector<std::string> line = plt_CommandLine(argc, argv);
    std::vector<char*> words;
    for (std::string& word : line) words.push_back(word.data());
    words.push_back(nullptr);
    return RunProgram(static_cast<int>(line.size()), words.data());
}

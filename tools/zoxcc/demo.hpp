// The demo: each family runs its conversions on the test picture and writes what it made.
#pragma once

#include "image.hpp"

#include <functional>
#include <string>
#include <vector>

namespace zt {

class Demo {
public:
    Demo(std::string dir, const Image& input) : dir_(std::move(dir)), input_(input) {}
    const Image& input() const { return input_; }
    // Runs `call` a few times, records its best time against `bytes` of input plus output; false and
    // a message when it does not return zoxStatusOk.
    bool time(const std::string& name, std::size_t bytes, const std::function<int()>& call);
    // Writes an image into the demo folder.
    bool write(const std::string& file, const Image& img);
    void printTable() const;
    bool failed() const { return failed_; }

private:
    struct Row {
        std::string name;
        double ms;
        double mbps;
    };
    std::string dir_;
    const Image& input_;
    std::vector<Row> rows_;
    std::vector<std::string> files_;
    bool failed_ = false;
};

// One entry per family; each adds itself to the list in demo.cpp.
struct FamilyDemo {
    const char* family;
    void (*run)(Demo&);
};
const std::vector<FamilyDemo>& familyDemos();

// Families whose demos live in files of their own.
void grayDemo(Demo& d);
void twistDemo(Demo& d);
void wordsDemo(Demo& d);

} // namespace zt

// zoxcc: the library's version, the exports it holds, and a demo on a built-in test picture.
#include "demo.hpp"
#include "frame/exports.hpp"
#include "zoxcc.h"

#include <sys/stat.h>

#include <cerrno>
#include <cstdio>
#include <cstring>
#include <string>

namespace {

// The usage text, on stdout when asked for (exit 0), else on stderr (exit 2).
int usage(bool asked = false)
{
    std::fprintf(asked ? stdout : stderr, "usage: zoxcc version | list | demo [DIR]\n"
                         "  version     the library's version record\n"
                         "  list        the exported conversions, one a line\n"
                         "  demo [DIR]  converts a built-in test picture and writes the results as\n"
                         "              PPM/PGM files into DIR (default ./zoxcc-demo), with timings\n");
    return asked ? 0 : 2;
}

int version()
{
    const LibraryVersion* v = zoxccGetLibVersion();
    std::printf("%s\nversion %d.%d.%d revision %d (%s), target %.2s, built %s\n", v->name, v->major, v->minor, v->update,
                v->revision, v->versionText, v->targetCode, v->buildDate);
    return 0;
}

int list()
{
    std::printf("zoxccGetLibVersion\n");
#define ZT_LIST(name, ...) std::printf("%s\n", #name);
    ZOX_ALL_EXPORTS(ZT_LIST)
#undef ZT_LIST
    return 0;
}

int demo(const std::string& dir)
{
    if (mkdir(dir.c_str(), 0777) != 0 && errno != EEXIST) {
        std::fprintf(stderr, "zoxcc: cannot create %s: %s\n", dir.c_str(), std::strerror(errno));
        return 1;
    }
    const zt::Image input = zt::testPicture(1920, 1080);
    zt::Demo d(dir, input);
    d.write("input.ppm", input);
    for (const zt::FamilyDemo& f : zt::familyDemos())
        f.run(d);
    std::printf("zoxcc demo: 1920x1080 test picture (colour bars, ramps, zone plate)\n\n");
    d.printTable();
    return d.failed() ? 1 : 0;
}

} // namespace

int main(int argc, char** argv)
{
    if (argc < 2)
        return usage();
    const std::string cmd = argv[1];
    if (cmd == "help" || cmd == "-h" || cmd == "--help")
        return usage(true);
    if (cmd == "version" && argc == 2)
        return version();
    if (cmd == "list" && argc == 2)
        return list();
    // A folder name never starts with '-': that is an option this tool does not have.
    if (cmd == "demo" && (argc == 2 || (argc == 3 && argv[2][0] != '-')))
        return demo(argc == 3 ? argv[2] : "zoxcc-demo");
    return usage();
}

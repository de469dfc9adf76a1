// kruszarka-sounds FOLDER: writes the game's fourteen sound effects into FOLDER, the same bytes on every run.
#include <cstdio>
#include <filesystem>
#include <system_error>

#include "tools/sounds/recipes.h"
#include "tools/sounds/wav_file.h"

int main(int argc, char** argv)
{
    if (argc != 2) {
        std::fprintf(stderr, "usage: kruszarka-sounds FOLDER\n");
        return 2;
    }
    const std::filesystem::path folder = argv[1];
    std::error_code error;
    std::filesystem::create_directories(folder, error);
    for (const kr::sounds::Recipe& recipe : kr::sounds::Recipes()) {
        if (!kr::sounds::WriteWav(folder / recipe.file, recipe.make())) {
            std::fprintf(stderr, "kruszarka-sounds: cannot write %s\n", (folder / recipe.file).c_str());
            return 1;
        }
    }
    return 0;
}

#include "tests/session.h"

#include <gtest/gtest.h>

#include <fstream>
#include <random>
#include <stdexcept>

namespace kr::testing {

TempFolder::TempFolder()
{
    static std::mt19937 names{std::random_device{}()};
    path_ = std::filesystem::temp_directory_path() / ("kruszarka-test-" + std::to_string(names()));
    std::filesystem::create_directories(path_);
}

TempFolder::~TempFolder()
{
    std::error_code ignored;
    std::filesystem::remove_all(path_, ignored);
}

std::string ReadFile(const std::filesystem::path& file)
{
    std::ifstream in(file, std::ios::binary);
    std::ostringstream text;
    text << in.rdbuf();
    return text.str();
}

void WriteFile(const std::filesystem::path& file, const std::string& text)
{
    std::ofstream(file, std::ios::binary) << text;
}

namespace {

std::filesystem::path Prepare(const TempFolder& folder, const std::string& progress)
{
    const std::filesystem::path file = folder.File("config.cfg");
    if (!progress.empty()) WriteFile(file, progress);
    return file;
}

}  // namespace

Session::Session(uint32_t seed, const std::string& progress)
    : runner_(out_, seed, {}, Prepare(folder_, progress)), game(runner_.game())
{
    Must("start");
}

Session::Session(uint32_t seed, const std::function<void(const TempFolder&)>& plant)
    : runner_(out_, seed, {}, folder_.File("config.cfg")), game(runner_.game())
{
    plant(folder_);
    Must("start");
}

int Session::Run(const std::string& lines)
{
    std::istringstream in(lines);
    return runner_.Run(in);
}

void Session::Must(const std::string& line)
{
    if (Run(line) != 0) throw std::runtime_error("scenario line failed: " + line + "\n" + out_.str());
}

int64_t Session::AdvanceUntil(const std::function<bool()>& done, int limit)
{
    for (int waited = 0; !done(); ++waited) {
        if (waited >= limit) {
            ADD_FAILURE() << "waited " << limit << " ms in vain";
            break;
        }
        game.timers.Advance(1);
    }
    return game.timers.Now();
}

void Session::SetBoard(const std::string& rows) { Must("board\n" + rows); }

std::string Session::Print(const std::string& name)
{
    TakeOutput();
    Must("print " + name);
    std::string line = TakeOutput();
    const std::string prefix = name + " = ";
    if (line.rfind(prefix, 0) != 0) throw std::runtime_error("unexpected output: " + line);
    line = line.substr(prefix.size());
    if (!line.empty() && line.back() == '\n') line.pop_back();
    return line;
}

std::vector<int> Session::Sounds()
{
    TakeOutput();
    Must("sounds");
    std::istringstream words(TakeOutput().substr(std::string("sounds:").size()));
    std::vector<int> played;
    for (int channel = 0; words >> channel;) played.push_back(channel);
    return played;
}

std::string Session::TakeOutput()
{
    std::string text = out_.str();
    out_.str({});
    return text;
}

void Session::StartMission(int index)
{
    Click("\"Gra\"");
    Click("Command4(" + std::to_string(index) + ")");
    Click("\"Rozpocznij misję ->\"");
    Advance(64 * 30);
}

}  // namespace kr::testing

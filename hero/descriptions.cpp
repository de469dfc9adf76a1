#include "hero/descriptions.h"

#include <array>
#include <charconv>

#include "hero/skills.h"
#include "shell/game.h"
#include "shell/texts.h"

namespace kr {
namespace {

constexpr std::array<const char*, kSkillCount> kSkillNames{
    "Celny strzał", "Teleport", "Bullet Time", "Rzut granatem", "Leczenie", "Wybuch", "Śmiercionośne naboje"};

std::string Number(int value) { return std::to_string(value); }

}  // namespace

std::string DecimalComma(double value)
{
    // Shortest round-trip digits, whatever the machine's locale; the game always writes a comma.
    std::array<char, 32> digits{};
    const auto written = std::to_chars(digits.data(), digits.data() + digits.size(), value);
    std::string text(digits.data(), written.ptr);
    for (char& c : text)
        if (c == '.') c = ',';
    return text;
}

std::string SkillDescription(const Game& g, int skill)
{
    const int strength = g.Strength;
    const int intelligence = g.Intelligence;
    std::string text;
    switch (skill) {
    case kAimedShot:
        text = "Zadaje obrażenia " + Number(strength + 1) + "-" + Number(strength + 3) +
               " i unieruchamia wroga na 2 tury.";
        break;
    case kTeleport:
        text = "Zamienia miejscami dwa dowolne pola na planszy (uwzględnia karę za niepołączenie ikon).";
        break;
    case kBulletTime:
        text = "Czas leci wolniej! Masz więcej czasu na rozbrajanie bomb, a przeciwnicy atakują z 2x mniejszą "
               "częstotliwością.";
        break;
    case kGrenade:
        text = "Niszczy spory obszar na planszy. Każdy zniszczony brązowy pocisk zadaje przeciwnikowi " +
               DecimalComma(strength * 0.5 + 1) + " pkt obrażeń.";
        break;
    case kHealing:
        text = "Leczy " + Number(intelligence * 5 + 10) + "-" + Number(intelligence * 10 + 15) + " obrażeń.";
        break;
    case kBlast: text = "Usuwa wszystkie elementy wybranego typu z planszy."; break;
    default: text = "Przez 3 tury zadajesz " + Number(strength + 2) + "x więcej obrażeń od naboi."; break;
    }
    return std::string(kSkillNames[static_cast<size_t>(skill)]) + "\r\n\r\n" + text;
}

std::string HeroAttributesText(const Game& g)
{
    return "MOC:          " + Number(g.Strength) + "\r\n" +
           "ZRĘCZNOŚĆ:    " + Number(g.Dexterity) + "\r\n" +
           "CELNOŚĆ:      " + Number(g.Accuracy) + "\r\n" +
           "WYTRZYMAŁOŚĆ: " + Number(g.Endurance) + "\r\n" +
           "INTELIGENCJA: " + Number(g.Intelligence);
}

void ShowSkillDescription(Game& g, const int16_t& skill)
{
    if (skill < 0 || skill >= kSkillCount) return;
    g.screen.TutorialPanel->visible = false;
    g.screen.HoverLabel->caption = SkillDescription(g, skill);
}

void ShowHeroAttributes(Game& g)
{
    g.screen.TutorialPanel->visible = false;
    g.screen.HoverLabel->caption = HeroAttributesText(g);
}

void ClearDescription(Game& g)
{
    g.screen.TutorialPanel->visible = true;
    g.screen.HoverLabel->caption.clear();
}

void ShowAttributeDescription(Game& g, int row)
{
    if (row < 0 || row >= static_cast<int>(kAttributeDescriptions.size())) return;
    g.screen.AttributeDescription->caption = kAttributeDescriptions[static_cast<size_t>(row)];
}

}  // namespace kr

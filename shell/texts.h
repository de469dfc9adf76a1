#pragma once
#include <array>

namespace kr {

inline constexpr const char* kContactLine = "ekipa Kruszarki";

inline constexpr const char* kMissingProgressMessage = "Nie moge znalezc pliku konfiguracyjnego!";

// The level-up rows and every on-screen list of attributes use this order, not the storage order.
inline constexpr std::array<const char*, 5> kAttributeNames{"MOC", "ZRĘCZNOŚĆ", "CELNOŚĆ", "WYTRZYMAŁOŚĆ",
                                                            "INTELIGENCJA"};

inline constexpr std::array<const char*, 5> kAttributeDescriptions{
    "MOC zwiększa siłę ataków specjalnych: celnego strzału, rzutu granatem i śmiercionośnych naboi.",
    "ZRĘCZNOŚĆ zwiększa Twoje zdolności inżynieryjne, łączenie kluczy daje teraz lepsze efekty (+50% od wartości "
    "bazowej)",
    "CELNOŚĆ podwyższa skuteczność Twoich strzałów - łączenie naboi zadaje o 50% obrażeń więcej (liczone od "
    "wartości bazowej)",
    "WYTRZYMAŁOŚĆ powiększa Twoje punkty życia o 25%",
    "INTELIGENCJA daje bonus +50% przy łączeniu czerwonych krzyżyków i ulepsza zdolność *Leczenie*.",
};

// Hints 1..14 of the tutorial panel (index 0 unused).
inline constexpr std::array<const char*, 15> kTutorialTexts{
    "",
    "Gra polega na łączeniu poziomo bądź pionowo trzech takich samych ikon. Naciśnij dowolne pole na planszy i "
    "zamień je z sąsiednim, klikając na nie.",
    "Brązowe naboje występują w dwóch wersjach: z zielonym i czerwonym łebkiem. Mogą się one wzajemnie mieszać, a "
    "nabój zielony podwaja zadane obrażenia.",
    "Łącząc klucze francuskie używasz swoich zdolności inżynieryjnych, rozbrajając bomby lub otwierając terminale.",
    "Łączenie czerwonych krzyżyków odnawia Twoje punkty życia.",
    "Łączenie wszystkich rodzajów ikon, za wyjątkiem brązowych naboi, daje Ci trochę *zasobów*, co pozwala Ci "
    "używać specjalnych umiejętności.",
    "Przy każdej zdolności widnieją ikony - właśnie tyle surowców potrzebujesz, aby móc użyć danej umiejętności. "
    "Niektóre nie są dostępne, gdy nie walczysz z wrogiem.",
    "Po każdej misji zdobywasz dodatkową umiejętność - aż zdobędziesz wszystkie 7.",
    "Łączenie 4 pól daje o 50% lepsze rezultaty, a 5 - o 100%. Dodatkowo za 4 ikony dostajesz 2 punkty surowców, "
    "a za 5 - 3 punkty surowców.",
    "Każdy ruch musi zaowocować usunięciem ikon z planszy, w przeciwnym wypadku Twój bohater straci 33% swojego "
    "życia!",
    "Nie musisz się obawiać, że zabraknie możliwych ruchów - w takiej sytuacji plansza generowana jest od nowa.",
    "Po prawej stronie ekranu wyświetlone są cele misji - może to być przeciwnik, terminal lub bomba, albo różne "
    "kombinacje wyżej wymienionych.",
    "Jeśli cel jest w żółtej ramce, to znaczy, że jest obowiązkowy do przejścia misji. Jeśli w niebieskiej - cel "
    "został wykonany.",
    "Po każdej misji możesz ulepszyć jedną z cech Twojej postaci. Możesz sprawdzić ich stan naprowadzając myszkę "
    "na portret Twojego bohatera.",
    "Możesz wyłączyć pojawianie się tego samouczka na ekranie opcji, dostępnym z menu. Tam też możesz wyłączyć "
    "dźwięki i zresetować swoją postać.",
};

// The sound channels' files, relative to the game's folder.
inline constexpr std::array<const char*, 14> kSoundFiles{
    "dzwieki/strzal1.wav", "dzwieki/strzal2.wav", "dzwieki/pudlo1.wav",  "dzwieki/odglos.wav",
    "dzwieki/reload.wav",  "dzwieki/inzynier.wav", "dzwieki/leczenie.wav", "dzwieki/koniec.wav",
    "dzwieki/przegrana.wav", "dzwieki/bum.wav",    "dzwieki/start.wav",    "dzwieki/uzyj.wav",
    "dzwieki/bullettime.wav", "dzwieki/koniecmisji.wav",
};

// Mission briefings, by the index of the mission button.
inline constexpr std::array<const char*, 10> kBriefings{
    "To będzie misja szkoleniowa, rekrucie! Nauczysz się podstaw obcowania z bronią, a także wykażesz się "
    "zdolnościami inżynierskimi. Na początek musisz poradzić sobie z opancerzonymi drzwiami, które uda Ci się "
    "otworzyć, gdy będziesz zbierać ikony kluczy francuskich. Za drzwiami czekał będzie na Ciebie nasz robot "
    "szkoleniowy, którego musisz pokonać, łącząc ikony brązowych naboi lub używając specjalnej zdolności "
    ",,Strzał''. W razie problemów warto zajrzeć do podręcznika żołnierza na dole ekranu. Powodzenia!",
    "Sprawa jest prosta - banda świrów w kolorowych ubrankach terroryzuje miasto, a Ty musisz ich powstrzymać. "
    "Giwera w dłoń i do dzieła!",
    "Kolorowe świry podłożyły bombę w centrum miasta. Przedrzyj się przez ich zastępy i użyj swoich zdolności "
    "saperskich, zanim pół miasta wyleci w powietrze!",
    "Cyrkowi terroryści schwytali Cię w pułapkę! Jesteś osłabiony, ale jeśli użyjesz swojego sprytu, z pewnością "
    "uda Ci się uciec. Znajdź wyjście z budynku, w ktorym Cię przetrzymują!",
    "Wiemy gdzie ci barwni idioci mają magazyn pełen broni. Dostań się do środka, podłóż bombę i wysadź tę budę w "
    "powietrze!",
    "Dostaliśmy informację o miejscu pobytu szefa tych rąbniętych psycholi. Udaj się tam i wykończ go! Poznasz go "
    "po idiotycznym odblaskowym kasku.",
    "Udało Ci się pokonać szefa szalonych kretynów, ale okazuje się, że to ktoś inny pociągał za sznurki. Teraz "
    "szukamy matoła w czerwonym berecie - znajdź go i wyeliminuj.",
    "Pokonałeś bossa tych wesołych bandziorów, ale to jeszcze nie koniec. Ci psychopaci robili jakieś "
    "eksperymenty na ludziach! Stworzyli nowy rodzaj żołnierza, wyglądający jak zombie! Że sztampowe? Może i tak, "
    "ale wciąż dobrze się sprzedaje. Czas na nich zapolować!",
    "Ładnie sobie radziłeś, wybijając zastępy *bezmózgich* kreatur, ale niestety okazało się, że chociaż może i "
    "mózgów nie mają, to potrafią myśleć. Maszkary zamknęły Cię w dziwnym pomieszczeniu. Gorsza informacja jest "
    "taka, że ustawiły zapalnik bomby. Musisz się stamtąd jak najszybciej wydostać!",
    "Czas skończyć z całym tym chaosem. Bierz najlepszą giwerę i szukaj zombiaka w żółtej bejsbolówce - kiedy on "
    "zginie, cała reszta przestanie być niebezpieczna. Co? Nie, nie wiem kto wymyslał ten scenariusz. Hm? Nie, "
    "dlaczego oni zakładają takie idiotyczne nakrycia głowy też nie wiem. Po prostu zrób swoje!",
};

}  // namespace kr

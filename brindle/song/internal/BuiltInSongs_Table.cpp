// SPDX-License-Identifier: MIT
// Made by tools/make_built_in_songs.py from data/built-in-songs.txt, examples/songs and
// tests/data/leadsheets, which tell where the songs come from.
#include "brindle/song/internal/BuiltInSongs_Table.h"

#include <array>

namespace brindle {
namespace {

// clang-format off
constexpr auto kBuiltInSongs = std::to_array<CBuiltInSongRow>({
    {"folk", "Red River Valley", "Traditional", "G major", 4, 0,
     "G | D7 | G | G | G | G | D7 | D7 | G | G7 | C | C | D7 | D7 | G | G"},
    {"folk", "Oh! Susanna", "Stephen Foster (1826-1864), 1848", "D major", 4, 0,
     "D | D | D | A7 | D | D | D A7 | D | D | D | D | A7 | D | D | D A7 | D | G | G | D | "
     "A7 | D | D | D A7 | D"},
    {"folk", "Camptown Races", "Stephen Foster (1826-1864), 1850", "D major", 4, 0,
     "D | D | A7 | A7 | D | D | A7 | D | D | D | G | D | D | D | A7 | D"},
    {"folk", "Old Folks at Home", "Stephen Foster (1826-1864), 1851", "D major", 4, 0,
     "D | G | D | A7 | D | G | D A7 | D | A7 | D | G | D A7 | D | G | D A7 | D"},
    {"folk", "My Old Kentucky Home", "Stephen Foster (1826-1864), 1853", "G major", 4, 0,
     "G | C G | G | D7 | G | C G | G D7 | G | G | C G | C | G | G | C G | G D7 | G"},
    {"folk", "Clementine", "Traditional", "F major", 3, 0,
     "F | F | F | C7 | C7 | F | C7 | F"},
    {"folk", "Home on the Range", "Daniel Kelley (1843-1905), 1873", "F major", 3, 0,
     "F | F7 | Bb | Bbm | F | G7 | C7 | C7 | F | F7 | Bb | Bbm | F | C7 | F | F | F | C7 | "
     "F | F | Dm | G7 | C7 | C7 | F | F7 | Bb | Bbm | F | C7 | F | F"},
    {"folk", "Streets of Laredo", "Traditional", "C major", 3, 0,
     "C | G7 | C | G7 | C | G7 | C | G7 | C | G7 | C | F | C | G7 | C | C"},
    {"folk", "Down in the Valley", "Traditional", "G major", 3, 0,
     "G | G | G | D7 | D7 | D7 | D7 | G | G | G | G | D7 | D7 | D7 | D7 | G"},
    {"folk", "My Bonnie Lies over the Ocean", "Traditional", "G major", 3, 0,
     "G | C | G | G | G | A7 | D7 | D7 | G | C | G | G | C | D7 | G | G | G | G | C | C | "
     "D7 | D7 | G | G | G | G | C | C | D7 | D7 | G | G"},
    {"folk", "Loch Lomond", "Traditional", "F major", 4, 0,
     "F | Dm | Bb | C7 | F | Dm | Gm C7 | F | Dm | Bb | F | Bb C7 | F | Dm | Gm C7 | F"},
    {"folk", "Scarborough Fair", "Traditional", "D minor", 3, 0,
     "Dm | Dm | C | Dm | Dm | F | G | Dm | Dm | Dm | F | F | C | C | C | C | Dm | F | C | "
     "C | Dm | C | Dm | Dm"},
    {"folk", "Wayfaring Stranger", "Traditional", "A minor", 3, 0,
     "Am | Am | Am | Am | Dm | Dm | Am | E7 | Am | Am | Am | Am | Dm | Dm | E7 | Am | F | "
     "F | C | C | F | F | E7 | E7 | Am | Am | Am | Am | Dm | E7 | Am | Am"},
    {"folk", "Shenandoah", "Traditional", "D major", 4, 0,
     "D | D | G | D | G | D | Bm | A7 | D | F#m | Bm | G | D | Em7 A7 | D | D"},
    {"folk", "Aura Lea", "George Poulton (1828-1867), 1861", "G major", 4, 0,
     "G | A7 | D7 | G | G | A7 | D7 | G | G B7 | Em | C Cm | G | G E7 | A7 | D7 | G"},
    {"folk", "The Wabash Cannonball", "Traditional", "G major", 4, 0,
     "G | G | C | C | D7 | D7 | G | G | G | G | C | C | D7 | D7 | G | G"},
    {"folk", "Careless Love", "Traditional", "F major", 4, 0,
     "F | C7 | F | F | F | F | C7 | C7 | F | F7 | Bb | Bbm | F | C7 | F | F"},
    {"folk", "When the Saints Go Marching In", "Traditional", "F major", 4, 0,
     "F | F | F | F | F | F | C7 | C7 | F | F7 | Bb | Bbm | F | C7 | F | F"},
    {"folk", "Swing Low, Sweet Chariot", "Traditional", "F major", 4, 0,
     "F | Bb F | F | C7 | F | Bb F | F C7 | F | F | Bb F | F | C7 | F | Bb F | F C7 | F"},
    {"folk", "Drink to Me Only with Thine Eyes", "Traditional", "F major", 3, 0,
     "F | C7 | F | Bb | F | C7 | F | F | F | C7 | F | Bb | F | C7 | F | F | F | Bb | F | "
     "Dm | F | G7 | C | C7 | F | C7 | F | Bb | F | C7 | F | F"},
    {"folk", "The Ash Grove", "Traditional", "G major", 3, 0,
     "G | Em | Am | D7 | G | C | D7 | G | G | Em | Am | D7 | G | C | D7 | G | G | Em | Am "
     "| D | G | C | A7 | D7 | G | Em | Am | D7 | G | C | D7 | G"},
    {"folk", "Water Is Wide", "Traditional", "C major", 4, 0,
     "C | F | C | Am | Am | Dm | G | G7 | Em | Am | F | Dm | G | F G7 | C | C"},
    {"hymn", "Old Hundredth", "Louis Bourgeois (1510-1559)", "G major", 4, 0,
     "G D Em Bm | C D G D | G D Em D | C G D G | G D G Em | G Am D D7 | G Em D C | G Am D7 "
     "G"},
    {"hymn", "Abide with Me", "William Henry Monk (1823-1889), 1861", "D major", 4, 0,
     "D A7 | D G | D Em | A7 D | D A7 | D G | D E7 | A A7 | D A7 | D D7 | G B7 | Em A7 | D "
     "G | D A7 | D A7 | D"},
    {"hymn", "Holy, Holy, Holy", "John Bacchus Dykes (1823-1876), 1861", "D major", 4, 0,
     "D Bm | A D | G | D | A D | A E7 | A | A7 | D Bm | A D | G | D | Bm D | G A7 | D G | "
     "D"},
    {"hymn", "Nearer, My God, to Thee", "Lowell Mason (1792-1872), 1856", "G major", 4, 0,
     "G | C | G Em | A7 D | G | C | G D7 | G | G C | G | G C | G D | G | C | G D7 | G"},
    {"hymn", "What a Friend We Have in Jesus", "Charles Converse (1832-1918), 1868", "F major", 4, 0,
     "F | Bb | F | C | F | Bb | F C7 | F | C7 | F | Bb F | C C7 | F | Bb | F C7 | F"},
    {"hymn", "Rock of Ages", "Thomas Hastings (1784-1872), 1830", "Bb major", 3, 0,
     "Bb | Eb Bb Bb | Bb F7 F7 | Bb | F7 | Bb | F7 | Bb | Bb | Eb Bb Bb | Bb F7 F7 | Bb"},
    {"hymn", "Silent Night", "Franz Xaver Gruber (1787-1863), 1818", "C major", 3, 0,
     "C | C | C | C | G7 | G7 | C | C7 | F | F | C | C | F | F | C | C | G7 | G7 | C | Am "
     "| C | G7 | C | C"},
    {"hymn", "Joyful, Joyful", "Ludwig van Beethoven (1770-1827), 1824", "G major", 4, 0,
     "G | D | G Em | D | G | D | Em Am | D7 G | D G | D G | D B7 Em A7 | D | G | D | Em Am "
     "| D7 G"},
    {"hymn", "Shall We Gather at the River", "Robert Lowry (1826-1899), 1864", "D major", 4, 0,
     "D | D | A7 | D | D | D | A7 | D | G | D | A7 | D | G | D | D A7 | D"},
    {"hymn", "It Is Well", "Philip Bliss (1838-1876), 1876", "C major", 4, 0,
     "C | F G | C | Am D7 | G | C F | D7 G | E7 Am | F Dm | C G7 | C | G7 | C | F | C G7 | "
     "C"},
    {"hymn", "In the Sweet By and By", "Joseph Webster (1819-1875), 1868", "G major", 4, 0,
     "G | C G | G | D7 | G | C G | G D7 | G | G | D7 | D7 | G | G | C | G D7 | G"},
    {"hymn", "Leaning on the Everlasting Arms", "Anthony Showalter (1858-1924), 1887", "A major", 4, 0,
     "A | D | A | E7 | A | D | A E7 | A | A | D | A | E7 | A | D | A E7 | A"},
    {"hymn", "O Come, All Ye Faithful", "John Wade (1711-1786), 1751", "G major", 4, 0,
     "G | D | G D G C | G D | Em A7 D G | D A7 D | D | D G | D G D7 G | G D | G D G | G D7 "
     "| G C | G D7 | G"},
    {"hymn", "Joy to the World", "Lowell Mason (1792-1872), 1839", "D major", 4, 0,
     "D | G A7 | D | G | A7 | D | D | D | D | D | A7 | A7 | D | D G | D A7 | D"},
    {"hymn", "Were You There", "Traditional", "D major", 4, 0,
     "D | G A7 | D | D G | D Bm | Em A7 | D | D7 | G | D | F#m Bm | Em A7 | D | G | D A7 | "
     "D"},
    {"ragtime", "Bill Bailey, Won't You Please Come Home", "Hughie Cannon (1877-1912), 1902", "F major", 4, 0,
     "F | F | F | F | F | F#o7 | C7 | C7 | C7 | C7 | C7 | C7 | C7 | C+ | F | C7 | F | F | "
     "F | F | F | F7 | Bb | D7 | Bb | Bo7 | F | D7 | G7 | C7 | F | C7 F"},
    {"ragtime", "Twelfth Street Rag", "Euday Bowman (1887-1949), 1914", "C major", 4, 0,
     "G7 | G7 | C | C | G7 | G7 | C | C | G7 | G7 | C | A7 | D7 | D7 | G7 | G7 | G7 | G7 | "
     "C | C | C7 | C7 | F | F | F | F#o7 | C | A7 | D7 | G7 | C | C"},
    {"ragtime", "The Easy Winners, First Strain", "Scott Joplin (1868-1917), 1901", "Ab major", 4, 0,
     "Ab | Ab | Eb7 | Ab | Ab | Ab | Bb7 | Eb7 | Ab | Ab | Eb7 | Ab7 | Db Do7 | Ab F7 | "
     "Bb7 Eb7 | Ab"},
    {"ragtime", "Give My Regards to Broadway", "George M. Cohan (1878-1942), 1904", "Bb major", 4, 0,
     "Bb | Bb Gm | Cm7 F7 | Cm7 F7 | F7 | F7 | Bb | Bb F7 | Bb | Bb Gm | F C7 | F | C7 | "
     "C7 | F7 | F7 | Bb | Bb Gm | Cm7 F7 | F7 | D7 | D7 | Gm | Gm | Eb Eo7 | Bb G7 | C7 | "
     "C7 | Cm7 | F7 | Bb Eb | Bb"},
    {"ragtime", "The Yankee Doodle Boy", "George M. Cohan (1878-1942), 1904", "G major", 4, 0,
     "G | A7 | D7 | G | G | A7 | D7 | D7 | G | G | A7 | D7 | B7 | Em | A7 | D7 | G | A7 | "
     "D7 | G | G | A7 | D7 | D7 | G | E7 | Am | Am | C C#o7 | G E7 | A7 D7 | G"},
    {"early jazz", "Back Home Again in Indiana", "James Hanley (1892-1942), 1917", "F major", 4, 0,
     "F | D7 | G7 | G7 | C7 | C7 | F | F7 | Bb | Bbm | F | D7 | G7 | G7 | Gm7 | C7 | F | "
     "D7 | G7 | G7 | A7 | A7 | Dm | Dm | F A7 | Dm Abo7 | F/A D7 | Gm7 C7 | F | F"},
    {"early jazz", "Lady, Be Good", "George Gershwin (1898-1937), 1924", "G major", 4, 0,
     "G6 | C9 | G6 | G6 Bbo7 | Am7 | D7 | G6 E7 | Am7 D7 | G6 | C9 | G6 | G6 Bbo7 | Am7 | "
     "D7 | G6 | G7 | C6 | C#o7 | G/D | G6 | Em7 | A7 | Am7 | D7 | G6 | C9 | G6 | G6 Bbo7 | "
     "Am7 | D7 | G6 | G6"},
    {"early jazz", "Somebody Loves Me", "George Gershwin (1898-1937), 1924", "G major", 4, 0,
     "G | G6 E7 | Am7 | D7 | G | C7 | Bm7 E7 | Am7 D7 | G | G7 | C | Cm6 | Em | A7 | Am7 | "
     "D7 | B7 | B7 | Em | Em | A7 | A7 | D7 | D7 | G | G6 E7 | Am7 | D7 | G7 | C Cm6 | G "
     "D7 | G"},
    {"early jazz", "Limehouse Blues", "Philip Braham (1881-1934), 1921", "Ab major", 4, 0,
     "Db7 | Db7 | Db7 | Db7 | Bb7 | Bb7 | Bb7 | Bb7 | Ab | Ab | C7 | Fm | Bb7 | Bb7 | Eb7 "
     "| Eb7 | Db7 | Db7 | Db7 | Db7 | Bb7 | Bb7 | Bb7 | Bb7 | Ab | F7 | Bbm | Bbm | Bb7 | "
     "Eb7 | Ab | Ab"},
    {"early jazz", "St. James Infirmary", "Traditional", "D minor", 4, 0,
     "Dm A7 | Dm | Dm Gm6 | A7 | Dm A7 | Dm Gm6 | Bb7 A7 | Dm"},
    {"early jazz", "Oh, Didn't He Ramble", "Traditional", "F major", 4, 0,
     "F | F | F | F | C7 | C7 | F | F7 | Bb | Bo7 | F | D7 | G7 | C7 | F | F"},
    {"early jazz", "Ballin' the Jack", "Chris Smith (1879-1949), 1913", "Bb major", 4, 0,
     "G7 | G7 | C7 | C7 | F7 | F7 | Bb | Bb | G7 | G7 | C7 | C7 | F7 | F7 | Bb Eo7 | Bb"},
    {"blues", "Frankie and Johnny", "Traditional", "C major", 4, 0,
     "C | C | C | C7 | F | F7 | F7 | C | G7 | G7 | C | C"},
    {"blues", "Twelve Bars", "Traditional", "C major", 4, 0,
     "C7 | C7 | C7 | C7 | F7 | F7 | C7 | C7 | G7 | F7 | C7 | G7"},
    {"blues", "Twelve Bars with a Quick Change", "Traditional", "A major", 4, 0,
     "A7 | D7 | A7 | A7 | D7 | D7 | A7 | A7 | E7 | D7 | A7 | A7 E7"},
    {"blues", "Twelve Bars with a Turnaround", "Traditional", "F major", 4, 0,
     "F7 | Bb7 | F7 | F7 | Bb7 | Bo7 | F7 | D7 | Gm7 | C7 | F7 D7 | Gm7 C7"},
    {"blues", "Twelve Bars of Early Jazz", "Traditional", "Bb major", 4, 0,
     "Bb | Eb7 | Bb | Bb7 | Eb7 | Eo7 | Bb | G7 | C7 | F7 | Bb Eb7 | Bb F7"},
    {"blues", "Twelve Bars in Minor", "Traditional", "C minor", 4, 0,
     "Cm | Fm | Cm | Cm | Fm | Fm | Cm | Cm | Ab7 | G7 | Cm | G7"},
    {"blues", "Twelve Bars in Minor, Plain", "Traditional", "A minor", 4, 0,
     "Am | Am | Am | Am | Dm | Dm | Am | Am | E7 | Dm | Am | Am E7"},
    {"blues", "Eight Bars", "Traditional", "E major", 4, 0,
     "E | B7 | A | A | E B7 | E A | E | B7"},
    {"blues", "Eight Bars with a Diminished Chord", "Traditional", "G major", 4, 0,
     "G | B7 | C7 | C#o7 | G E7 | A7 D7 | G C7 | G D7"},
    {"blues", "Twelve Bars in Sevenths", "Traditional", "G major", 4, 0,
     "G7 | C7 | G7 | G7 | C7 | C7 | G7 | G7 | D7 | C7 | G7 C7 | G7 D7"},
    {"hymn", "Amazing Grace", "Traditional", "", 4, 1,
     "G | G7/B | C | G | G | Em | A7 | D7 | G | G7/B | C | G/D | Em | D7 | G | G"},
    {"folk", "Auld Lang Syne", "Traditional", "", 4, 1,
     "F . Dm . | Gm7 . C7 . | F . F7/A . | Bb . . . | F/C . Dm . | Gm7 . C7 . | Bb Gm7 C7 "
     ". | F . . ."},
    {"folk", "Greensleeves", "Traditional", "", 4, 1,
     "Am | C | G | Em | Am | F | E | E | Am | C | G | Em | Am | E7 | Am | Am | C | C | G | "
     "Em | Am | F | E | E | C | C | G | Em | Am | E7 | Am | Am"},
    {"folk", "House of the Rising Sun", "Traditional", "", 4, 1,
     "Am C D F | Am C E . | Am C D F | Am E7 Am E7"},
    {"early jazz", "Ain't We Got Fun?", "Richard Whiting (1891-1938), 1921", "", 4, 1,
     "Eb . . . | . . . . | Bb7 . . . | . . . . | . . . . | . . . . | Eb . . . | Eb7 . . . "
     "| Ab . . . | . B7 B7 . | Eb . . . | Cm7 . . . | Gm . . . | D7 Ddim Ddim . | D7 . . . "
     "| Gdim Fm Bbaug Bbaug | Eb . . . | . . . . | Bb7 . . . | . . . . | . . . . | . . . . "
     "| Eb . . . | Eb7 . . . | Ab . . . | Cm . Cm . | Fm D7 D7 . | Eb Abm6 Abm6 . | Eb . . "
     ". | F9 . . . | Bb7 . . . | Eb . . ."},
    {"folk", "Beautiful Dreamer", "Stephen Foster (1826-1864), 1864", "", 3, 1,
     "C . . | . . . | . . . | Dm . . | . . . | . . . | G7 . . | . . . | . . . | C . . | . "
     ". . | . . . | C . . | . . . | . . . | Dm . . | . . . | . . . | G7 . . | . . . | . . "
     ". | C . . | . . . | . . . | G7 . . | . . . | . . . | C . . | . . . | . . . | D7 . . "
     "| . . . | . . . | . . . | G7 . . | . . . | C . . | . . . | . . . | Dm . . | . . . | "
     ". . . | G7 . . | . . . | . . . | C . . | . . . | . . . | G7 . . | . . . | . . . | C "
     ". . | . . . | . . . | D7 . . | . . . | . . . | . . . | G7 . . | . . . | C . . | . . "
     ". | . . . | F . . | C . . | G7 . . | C . . | . . . | . . ."},
    {"hymn", "The Coventry Carol", "Traditional", "", 3, 1,
     "Gm . D | Gm . . | F . Gm | D . . | Gm F Gm | Cm . D7 | Gm . . | . . Bb | F . Gm | D "
     ". Gm | Cm6 . . | D . . | Gm D7 Gm | Cm . D | G . . | . . ."},
    {"hymn", "Down by the Riverside", "Traditional", "", 4, 0.5,
     ". . . . . . . . | Bb . . . . . . . | Ebm6 . . . Ebm6 . . . | Bb6 . . . . . . . | F7 "
     "Bb . Bb . . . . | F7 . . . . . . . | F7 Bb . Bb . . . . | Bb6 . . . . . . . | F7 Bb "
     ". Bb . . . . | Bb . . . . . . . | Ebm6 . . . Ebm6 . . . | Bb6 . . . . . . . | F7 Bb "
     ". Bb . . . . | F7 . . . . . . . | F7 . . . . . . . | Bb . . . . . . . | Bb7 . . . . "
     ". . . | Eb . . . . . . . | Eb . . . . . . . | Bb . . . . . . . | Bb . . . . . . . | "
     "F7 . . . . . . . | C7 . . . F7 . . . | Bb . . . . . . . | Bb7 . . . . . . . | Eb . . "
     ". . . . . | Eb . . . . . . . | Bb . . . . . . . | Bb . . . . . . . | F7 . . . . . . "
     ". | F7 . . . . . . . | Bb . . . . . . . | . . . . . . . . | Bb . . . . . . . | Bb . "
     ". . . . . . | Bb . . . . . . . | Bb . . . . . . . | Eb . . . . . . . | Eb . . . . . "
     ". . | Eb . . . . . . . | Bb . . . . . . . | Bb . . . . . . . | Bb . . . . . . . | Bb "
     ". . . . . . . | Eb . . . . . . . | . . . . . . . . | . . . . . . . . | Bb . . . . . "
     ". . | Bb . . . . . . ."},
    {"early jazz", "Honeysuckle Rose", "Fats Waller (1904-1943), 1929", "", 4, 0.5,
     "Gm7 . . . C7 . . . | . Gm7 . . C7 . . . | . Gm7 . . C7 . . . | Gm7 . . . C7 . . . | "
     "F . . . Dm7 . . . | Gm7 . . . . C7 . . | F6 . . . . . . . | Am7 . . . . . . . | Gm7 "
     ". . . C7 . . . | . Gm7 . . C7 . . . | . Gm7 . . C7 . . . | Gm7 . . . C7 . . . | F . "
     ". . Dm7 . . . | Gm7 . . . . C7 . . | . . F6 . . . . . | . . . . . . . . | F7 . . . . "
     ". . . | . . . . . . . . | Bb6 . . . . . . . | . . . . . . . . | G7 . . . . . . . | . "
     ". . . . . . . | C11 . . . . . . . | C7#9 . . . . . . . | . Gm7 . . C7 . . . | . Abm7 "
     ". . Db7 . . . | . Gm7 . . C7 . . . | Gm7 . . . C7 . . . | F . . . Dm7 . . . | Gm7 . "
     ". . C7 . . . | F6 . . . . . . ."},
    {"hymn", "Jesu, Joy of Man's Desiring", "Johann Sebastian Bach (1685-1750)", "", 3, 0.5,
     "G . . . C/E . | G/B . Em . . . | Am . G/B . C . | D . D/F# . D . | G . Em . C . | "
     "G/B . Em . Em/D . | C6 . C#m7b5 . D7 . | G . . . . . | . . . . C/E . | Em . . . D . "
     "| D/F# . . . G . | D . . . . . | D7 . . . . . | G/F# . . . C/E . | G/B . . . Em . | "
     "C6 . D . . . | G . . . C/E . | G/B . Em . . . | Am . G/B . C6 . | D . . . . . | G . "
     "Em . C . | G/B . Em . Em/D . | C6 . C#m7b5 . D7 . | G/F# . . . C/E . | Em7 . . . D . "
     "| D/F# . . . G . | D . . . . . | D7 . . . . . | G/F# . . . C/E . | Em7 . . . D . | "
     "C6 . D . D7 . | G . . . C/E . | G/B . Em . . . | Am . G/B . C6 . | D . . . . . | G . "
     "Em . C . | G/B . Em . Em/D . | C . C#m7b5 . D7 . | G . . . . . | D/C . . . E7/B . | "
     "Am . . . . . | Dm6 . . Bm7b5 E7 . | Am . F . Dm . | C6 . F . F/E . | Dm . D#dim7 . "
     "E7 . | Am . . . . . | A . . . C/E . | Dm7/F . . Dm7 G7 . | C . C/E . C7 . | F . Dm7 "
     ". G7 . | C . . . G/B . | G . . . C/E . | G/B . . . Em . | Am . C6 . . . | D . . . D7 "
     ". | . . . . . . | G/F# . . . C/E . | G/B . . . Em . | C6 . D . . . | G . . . . . | "
     "G7 . . . C/G . | D7/G . G . Em/G . | D7/G . . . . . | G . . . C/E . | G/B . Em . . . "
     "| Am . G/B . C6 . | D . . . . . | G . Em . C . | G/B . Em . Em/D . | C6 . C#m7b5 . "
     "D7 . | G . . . . . | . . . . C/E . | Em . . . D . | D/F# . . . G . | D . . . . . | "
     "D7 . . . . . | G/F# . . . C/E . | G/B . . . Em . | C6 . D . . . | G . . . C/E . | "
     "G/B . Em . . . | Am . G/B . C6 . | D . . . . . | G . Em . C . | G/B . Em . Em/D . | "
     "C6 . C#m7b5 . D7 . | G/F# . . . C/E . | Em7 . . . D . | D/F# . . . G . | D . . . . . "
     "| D7 . . . . . | G/F# . . . C/E . | Em7 . . . D . | C6 . D . D7 . | G . . . C/E . | "
     "G/B . Em . . . | Am . G/B . C6 . | D . . . . . | G . Em . C . | G/B . Em . Em/D . | "
     "C . C#m7b5 . D7 . | G . . . . . | D/C . . . E7/B . | Am . . . . . | Dm6 . . Bm7b5 E7 "
     ". | Am . F . Dm . | C6 . F . F/E . | Dm . D#dim7 . E7 . | Am . . . . . | A . . . C/E "
     ". | Dm7/F . . Dm7 G7 . | C . C/E . C7 . | F . Dm7 . G7 . | C . . . G/B . | G . . . "
     "C/E . | G/B . . . Em . | Am . C6 . . . | D . . . D7 . | . . . . . . | G/F# . . . C/E "
     ". | G/B . . . Em . | C6 . D . . . | G . . . . . | G7 . . . C/G . | D7/G . G . Em/G . "
     "| D7/G . . . . . | G . . . C/E . | G/B . Em . . . | Am . G/B . C6 . | D . . . . . | "
     "G . Em . C . | G/B . Em . Em/D . | C6 . C#m7b5 . D7 . | G . . . . ."},
    {"folk", "Jingle Bells", "James Pierpont (1822-1893), 1857", "", 4, 1,
     "G . . . | . . . . | . . . . | C . . . | . . Am . | D . . . | . . D7 . | G . . . | G "
     ". . . | . . . . | . . . . | C . . . | . . Am . | G/D . . . | . . D7 . | G . D7 . | G "
     ". . . | . . . . | . . . . | . . G7 . | C . . . | G . . . | A7 . . . | D7 . . . | G . "
     ". . | . . . . | . . . . | . . G7 . | C . . . | G . . . | D . D7 . | G . . . | G . . "
     ". | . . . . | . . . . | C . . . | . . Am . | D . . . | . . D7 . | G . . . | G . . . "
     "| . . . . | . . . . | C . . . | . . Am . | G/D . . . | . . D7 . | G . D7 . | G . . . "
     "| . . . . | . . . . | . . G7 . | C . . . | G . . . | A7 . . . | D7 . . . | G . . . | "
     ". . . . | . . . . | . . G7 . | C . . . | G . . . | D . D7 . | . . . ."},
    {"hymn", "Joshua Fit the Battle of Jericho", "Traditional", "", 4, 1,
     "Dm . . . | . . . . | A7 . . . | Dm . . . | . . . . | . . . . | A7 . . . | . . . Dm | "
     ". . . . | . . . . | . . . . | A7 . . . | Dm . . . | . . . . | A7 . . . | Dm . . . | "
     "Dm . . . | . . . . | A7 . . . | Dm . . . | . . . . | . . . . | A7 . . . | . . . Dm | "
     ". . . . | . . . . | . . . . | A7 . . . | Dm . . . | . . . . | A7 . . . | Dm . . . | "
     "Dm . . . | . . . . | A7 . . . | Dm . . . | . . . . | . . . . | A7 . . . | Dm . . . | "
     ". . . . | . . . . | . . . . | A7 . . . | Dm . . . | . . . . | A7 . . . | Dm . . . | "
     "Dm . . . | . . . . | A7 . . . | Dm . . . | . . . . | . . . . | A7 . . . | Dm . . ."},
    {"early jazz", "Makin' Whoopee!", "Walter Donaldson (1893-1947), 1928", "", 4, 0.5,
     ". . . . . . . . | Fmaj7 . . . F#dim7 . . . | Gm7 . . . C7 . . . | Cm7 . . . F7 . . . "
     "| Bbmaj7 . . . Eb7 . . . | Fmaj7 . . . Dm7 . . . | Db7 . . . C7 . . . | F6 . Dm7 . . "
     ". . . | Gm7 . . . C7 . . . | . . . Fmaj7 . . . F#dim7 | . . . Gm7 . . . C7 | . . . "
     "Cm7 . . . F7 | . . . Bbmaj7 . . . Eb7 | . . . Fmaj7 . . . Dm7 | . . . Db7 . . . C7 | "
     ". . . F6 . . . . | . . . . . . . . | . . . Am7b5 . . . D7b9 | . . . Gm7 . . . . | . "
     ". . Bbm7 . . Eb7 . | . . . Fmaj7 . . . . | . . . Am7b5 . . . D7b9 | . . . Gm . . . . "
     "| . . . Bbm7 . . . Eb7 | . . . D7b9 . . . Gm7 | . C7 . Fmaj7 . . . F#dim7 | . . . "
     "Gm7 . . . C7 | . . . Cm7 . . . F7 | . . . Bbmaj7 . . . Eb7 | . . . Fmaj7 . . . Dm7 | "
     ". . . Db7 . . . C7 | . . . F6 . Dm7 . . | . . . Gm7 . . . C7 | . . ."},
    {"ragtime", "Maple Leaf Rag", "Scott Joplin (1868-1917), 1899", "", 2, 0.25,
     "Eb . . . . . . Edim | Bb7 . . . . . . . | Eb . . . . . . Edim | Bb7 . . . . . . . | "
     "Cb . . . Bb7 . . . | Cb . . . Bb7 . . . | Ebm . . . . . . . | . . . . . . . . | Edim "
     ". . . . . . . | Eb . . . . . . . | Cb . . . Eb . . . | . . Bb7 . Eb . . . | Ebdim . "
     ". . . . . . | Eb . . . . . . . | Cb . . . Eb . . . | . . . . . . . . | Eb . . . . . "
     ". Edim | Bb7 . . . . . . . | Eb . . . . . . Edim | Bb7 . . . . . . . | Cb . . . Bb7 "
     ". . . | Cb . . . Bb7 . . . | Ebm . . . . . . . | . . . . . . . . | Edim . . . . . . "
     ". | Eb . . . . . . . | Cb . . . Eb . . . | . . Bb7 . Eb . . . | Ebdim . . . . . . . "
     "| Eb . . . . . . . | Cb . . . Eb . . . | . . . . . . . . | Bb . . . . . . . | Bb7 . "
     ". . . . . . | Eb . . . . . . . | . . . . . . Edim . | Bb7 . . . . . . . | . . . . . "
     ". . . | Eb . . . . . . . | . . . . . . . . | Bb . . . . . . . | Bb7 . . . . . . . | "
     "Eb . . . . . . . | . . . . D7 . Db7 . | C7 . . . . . . . | Fm . C7 . Fm . . . | F9 . "
     ". . Bb7 . . . | Eb . . . . . . . | Bb . . . . . . . | Bb7 . . . . . . . | Eb . . . . "
     ". . . | . . . . . . Edim . | Bb7 . . . . . . . | . . . . . . . . | Eb . . . . . . . "
     "| . . . . . . . . | Bb . . . . . . . | Bb7 . . . . . . . | Eb . . . . . . . | . . . "
     ". D7 . Db7 . | C7 . . . . . . . | Fm . C7 . Fm . . . | F9 . . . Bb7 . . . | Eb . . . "
     ". . . . | Eb . . . . . . Edim | Bb7 . . . . . . . | Eb . . . . . . Edim | Bb7 . . . "
     ". . . . | Cb . . . Bb7 . . . | Cb . . . Bb7 . . . | Ebm . . . . . . . | . . . . . . "
     ". . | Edim . . . . . . . | Eb . . . . . . . | Cb . . . Eb . . . | . . Bb7 . Eb . . . "
     "| Ebdim . . . . . . . | Eb . . . . . . . | Cb . . . Eb . . . | . . . . . . . ."},
    {"folk", "Smilin' Through", "Arthur Penn (1875-1941), 1919", "", 3, 0.5,
     ". . . . Eb . | . . Ebmaj7 . Eb7 . | Ab . Bb7 . . . | Eb . Eb7 . Fm7b5 . | Eb . . . . "
     "Bb7 | Eb . Ebmaj7 . Eb7 . | Abmaj7 . Fm/Ab . Eb . | Bb7 . Ab . Bb7 . | Eb . . . . . "
     "| . . Ebmaj7 . Eb7 . | Abmaj7 . Fm/Ab . Adim . | Bb7 . . . . . | . . . . . . | Eb . "
     ". . Gbdim . | Bb7 . . . . . | C7 . . . . . | C7sus4 Abdim . . Bb7 . | Eb . F7 . Bb7 "
     ". | Eb . Fm7 . Bb7 . | Eb . . . . . | . . . . Eb Bb7 | Eb . Ebmaj7 . Eb7 . | Abmaj7 "
     ". Fm/Ab . Eb . | Bb7 . Ab . Bb7 . | Eb . . . . . | Eb . Ebmaj7 . Eb7 . | Abmaj7 . "
     "Fm/Ab . Adim . | Bb7 . . . . . | . . . . . . | Eb . . . Gbdim . | Bb7 . . . . . | "
     "C7b9 . . . . . | C7sus4 Abdim . . Bb7 . | Eb . F7 . Bb7 . | Eb . Fm7 . Bb7 . | Eb . "
     ". . . . | Bb7 . . . Eb Bb7 | Eb . Ebmaj7 . Eb7 . | Abmaj7 . Fm/Ab . Eb . | Bb7 . Ab "
     ". Bb7 . | Eb . . . . . | . . Ebmaj7 . Eb7 . | Abmaj7 . Fm/Ab . Adim . | Bb7 . . . . "
     ". | . . . . . . | Eb . . . Gbdim . | Bb7 . . . . . | C7 . . . . . | C7sus4 Abdim . . "
     "Bb7 . | Eb . F7 . Bb7 . | Eb . Fm7 . Bb7 . | Eb . . . . ."},
    {"hymn", "Sometimes I Feel Like a Motherless Child", "Traditional", "", 4, 1,
     "Am . . . | . . . . | E7 . . . | Am . . . | E7 . . . | . . . . | . . . . | Am . . . | "
     ". . . . | . . . . | . . . . | Am . . . | . . . . | . . . . | E . . . | Am . . . | . "
     ". . . | . . . . | . . . . | . . . . | Am . . . | . . . . | E7 . . . | Am . . . | E7 "
     ". . . | . . . . | . . . . | Am . . . | . . . . | . . . . | . . . . | Am . . . | . . "
     ". . | . . . . | E . . . | Am . . . | . . . . | . . . . | . . . . | . . . . | . . . . "
     "| . . . . | D7 . . . | Am . . . | E7 . . . | . . . . | . . . . | Am . . . | . . . . "
     "| . . . . | . . . . | . . . . | . . . . | . . . . | E . . . | Am . . . | . . . . | . "
     ". . . | . . . . | . . . . | . . . . | . . . . | D7 . . . | Am . . . | E7 . . . | . . "
     ". . | . . . . | Am . . . | . . . . | . . . . | . . . . | . . . . | . . . . | . . . . "
     "| E . . . | Am . . . | . . . . | . . . . | . . . . | . . . ."},
    {"ragtime", "The Entertainer", "Scott Joplin (1868-1917), 1902", "", 4, 0.5,
     ". . . . . . . . | C . . C7 . . . F | . . . . C . . . | C . . G7 . . . . | C . . . . "
     ". . . | C . . . C7 . . F | . . . . C . . . | D . . . . . . . | G7 . . . . . . . | C "
     ". . . C7 . . F | . . . . C . . . | . . . G7 . . . . | C . . . . . . . | C . . C7 . . "
     ". . | F . . Fm . . . . | C . . G7 . . . . | C . . . . . . . | C . . . . . . . | C . "
     ". . . . . . | F . . . Fm . . . | C . . . G7 . . . | C . . . . . . . | C . . . . . . "
     ". | G . . D7 . . . . | G7 . . . . . . . | C . . . . . . . | . . . . . . . . | F . . "
     ". Fm . . . | C . . . . . . . | Dm7 . . . . . . . | C . . . . . . . | D7 . . . G7 . . "
     ". | C . . . . . . . | C . . C7 . . . F | . . . . C . . . | . . . . G7 . . . | C . . "
     ". . . . . | . . . C7 . . . . | F . . . . . . . | C . . . G7 . . . | C . G . C . . ."},
    {"folk", "The Skye Boat Song", "Traditional", "", 3, 1,
     "G . . | Em/B . . | Am/C . . | D7 . . | G . . | C . . | D7 . . | . . . | G . . | Em/B "
     ". . | Am/C . . | D7 . . | G . . | Em . . | G . . | . . . | Em . . | Em(maj7) . . | "
     "Am . . | Gbm7b5 . . | Em . . | . . B | Em . . | . . . | . . . | Em(maj7) . . | Am . "
     ". | Gbm7b5 . . | Em . . | . . B | Em . . | D7 . . | G . . | Em/B . . | Am/C . . | D7 "
     ". . | G . . | C . . | D7 . . | . . . | G . . | Em/B . . | Am/C . . | D7 . . | G . . "
     "| Em . . | G . . | . . . | Em . . | Em(maj7) . . | Am . . | Gbm7b5 . . | Em . . | . "
     ". B | Em . . | . . . | . . . | Em(maj7) . . | Am . . | Gbm7b5 . . | Em . . | . . B | "
     "Em . . | D7 . . | G . . | Em/B . . | Am/C . . | D7 . . | G . . | C . . | D7 . . | . "
     ". . | G . . | Em/B . . | Am/C . . | D7 . . | G . . | Em . . | G . . | . . . | Em . . "
     "| Em(maj7) . . | Am . . | Gbm7b5 . . | Em . . | . . B | Em . . | . . . | . . . | "
     "Em(maj7) . . | Am . . | Gbm7b5 . . | Em . . | . . B | Em . . | D7 . . | G . . | Em/B "
     ". . | Am/C . . | D7 . . | G . . | C . . | D7 . . | . . . | G . . | Em/B . . | Am/C . "
     ". | D7 . . | G . . | Em . . | G . . | . . . | Em . . | Em(maj7) . . | Am . . | "
     "Gbm7b5 . . | Em . . | . . B | Em . . | . . . | . . . | Em(maj7) . . | Am . . | "
     "Gbm7b5 . . | Em . . | . . B | Em . . | D7 . . | G . . | Em/B . . | Am/C . . | D7 . . "
     "| G . . | C . . | D7 . . | . . . | G . . | Em/B . . | Am/C . . | D7 . . | G . . | Em "
     ". . | G . . | . . ."},
    {"hymn", "We Three Kings", "John Hopkins (1820-1891), 1857", "", 3, 1,
     "Dm . . | C . F | Bb . F | C . F | F . . | . . . | Bb . Gm/Bb | F . . | Dm . . | . . "
     ". | A7 Aaug A7 | Dm . . | . . . | . . . | A7 Aaug A7 | Dm . . | Dm . . | C . . | F . "
     ". | F/A C7/G F | Gm Gm9 Gm | Dm/A . A7 | Dm . . | A . A7 | D . . | . . . | G . Em/G "
     "| D . . | . . . | . . . | G . Em/G | D . . | Bbm . . | A . D | G . D | A . D | D . . "
     "| . . . | G . Em/G | D . . | Dm . . | . . . | A7 Aaug A7 | Dm . . | . . . | . . . | "
     "A7 Aaug A7 | Dm . . | Dm . . | C . . | F . . | F/A C7/G F | Gm Gm9 Gm | Dm/A . A7 | "
     "Dm . . | A . A7 | D . . | . . . | G . Em/G | D . . | . . . | . . . | G . Em/G | D . "
     ". | Bbm . . | A . D | G . D | A . D | D . . | . . . | G . Em/G | D . . | Dm . . | . "
     ". . | A7 Aaug A7 | Dm . . | . . . | . . . | A7 Aaug A7 | Dm . . | Dm . . | C . . | F "
     ". . | F/A C7/G F | Gm Gm9 Gm | Dm/A . A7 | Dm . . | A . A7 | D . . | . . . | G . "
     "Em/G | D . . | . . . | . . . | G . Em/G | D . . | Bbm . . | A . D | G . D | A . D | "
     "D . . | . . . | G . Em/G | D . . | Dm . . | . . . | A7 Aaug A7 | Dm . . | . . . | . "
     ". . | A7 Aaug A7 | Dm . . | Dm . . | C . . | F . . | F/A C7/G F | Gm Gm9 Gm | Dm/A . "
     "A7 | Dm . . | A . A7 | D . . | . . . | G . Em/G | D . . | . . . | . . . | G . Em/G | "
     "D . . | Bbm . . | A . D | G . D | A . D | D . . | . . . | G . Em/G | D . . | Dm . . "
     "| . . . | A7 Aaug A7 | Dm . . | . . . | . . . | A7 Aaug A7 | Dm . . | Dm . . | C . . "
     "| F . . | F/A C7/G F | Gm Gm9 Gm | Dm/A . A7 | Dm . . | A . A7 | D . . | . . . | G . "
     "Em/G | D . . | . . . | . . . | G . Em/G | D . . | Bbm . . | A . D | G . D | A . D | "
     "D . . | . . . | G . Em/G | D . ."},
    {"blues", "West End Blues", "King Oliver (1881-1938), 1928", "", 4, 0.5,
     ". . . . . . . . | Eb . . . . . . . | . . . . . . . . | . . . . . . . . | Eb7 . . . . "
     ". . . | Ab7 . . . . . . . | . . . . . . . . | Eb . . . . . . . | . . . . . . . . | "
     "Bb7 . . . . . . . | . . . . . . . . | Eb . . . . . . . | . . . . Bb7 . . . | Eb . . "
     ". . . . . | Ab7 . . . . . . . | Eb . . . . . . . | Eb7 . . . . . . . | Ab7 . . . . . "
     ". . | . . . . . . . . | Eb . . . . . . . | . . . . . . . . | Bb7 . . . . . . . | . . "
     ". . . . . . | Eb . . . . . . . | . . . . . Bb7 . . | Eb . . . . . . . | Eb7 . . . . "
     ". . . | Ab7 . . . . . . . | . . . . . . . . | Eb . . . . . . . | . . . . . . . . | "
     "Bb7 . . . . . . . | . . . . . . . . | Eb . . . . . . . | . . . . Bb7 . . . | Eb . . "
     ". . . . . | . . . . . . . . | . . . . . . . . | Eb7 . . . . . . . | Ab7 . . . . . . "
     ". | . . . . . . . . | Eb . . . . . . . | . . . . . . . . | . . . . . . . . | . . . . "
     ". . . . | . . . . . . . . | . . . . . . . ."},
    {"folk", "What Child Is This", "Traditional", "", 3, 0.5,
     ". . . . . . | . . . . . . | . . . . . . | Em . . . . . | D . . . . . | Em . . . . . "
     "| Bm . . . . . | Em . . . . . | D . . . . . | Em . . B . . | Em . . . . . | G . . . "
     ". . | D . . Bm . . | Em . . . . . | Bm . . . . . | G . . . . . | D . . Bm . . | Em . "
     ". B7 . . | Em . . . . . | Em . . . . . | D . . . . . | Em . . . . . | Bm . . . . . | "
     "Em . . . . . | D . . . . . | Em . . B . . | Em . . . . . | G . . . . . | D . . Bm . "
     ". | Em . . . . . | Bm . . . . . | G . . . . . | D . . Bm . . | Em . . B7 . . | Em . "
     ". . . ."},
    {"folk", "Drunken Sailor", "Traditional", "", 4, 1,
     "Dm . . . | C . . . | Dm . . . | C . Dm . | Dm . . . | C . . . | Dm . . . | C . Dm ."},
});
// clang-format on

}  // namespace

std::span<const CBuiltInSongRow> BuiltInSongRows() {
    return kBuiltInSongs;
}

}  // namespace brindle

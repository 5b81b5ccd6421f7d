/* SPDX-License-Identifier: MIT */
#ifndef BRINDLE_C_BRINDLE_H
#define BRINDLE_C_BRINDLE_H

/**
 * @file
 * Brindle for C and for all languages that reach a library through C. Plain C11.
 *
 * Texts. All texts, also those that are handed in, are UTF-8 and end with a NUL. A `const char*`
 * that a function gives belongs to the handle that it was asked of, or to the library, and is not
 * freed. A `char**` receives a text of the caller's own, to be freed with brindle_free.
 *
 * Handles. Each has a function that frees it, which takes NULL, too. A handle keeps what it was
 * made of: a song may be freed while its analysis lives.
 *
 * Errors. A function that can fail gives a brindle_status; then what it was to fill is NULL or
 * undefined, and brindle_last_error tells the calling thread what is wrong. NULL where a handle, a
 * text or a place for a result is needed is BRINDLE_ERROR_ARGUMENT, unless NULL is said to be
 * allowed; so is an index out of range. A function that gives a value or a text of a handle gives
 * 0 or "" for NULL. Nothing is thrown across this border.
 *
 * Threads. All functions may be called from several threads at once, each on handles of its own. A
 * handle that nobody changes may be read by several threads: songs, analyses, names, grids and
 * models of songs never change, finding in a grid package or generating with a brindle_markov
 * counts as change. The three functions that set up the library are to be called before other
 * threads use it.
 *
 * Enumerators. Where a value goes in or out of a record it is an int, so that any number may come
 * in; one that is no enumerator is an error or counts as 0.
 *
 * Positions and lengths are beats from the beginning of the song: quarter notes in a score, what
 * the song itself counts in a text.
 */

#include <stddef.h>
#include <stdint.h>

/**
 * @def BRINDLE_API
 * Stands before each function that the shared library exports. A host on Windows that uses the
 * shared library defines BRINDLE_SHARED before it includes this header.
 */
#if defined(BRINDLE_API)
#elif defined(_WIN32) && defined(BRINDLE_SHARED)
#define BRINDLE_API __declspec(dllimport)
#elif defined(__GNUC__)
#define BRINDLE_API __attribute__((visibility("default")))
#else
#define BRINDLE_API
#endif

#ifdef __cplusplus
extern "C" {
#endif

/* Version */

/** Grows by one with each change of this header that a host must be compiled anew for. */
#define BRINDLE_API_VERSION 1

/** The version of the library that runs, "0.1.0". */
BRINDLE_API const char* brindle_version(void);
/** The BRINDLE_API_VERSION that the library that runs was built with. */
BRINDLE_API int brindle_api_version(void);

/* Errors */

/** What became of a call. */
typedef enum brindle_status {
    BRINDLE_OK = 0,              /**< all that was asked for was done */
    BRINDLE_ERROR_ARGUMENT = 1,  /**< NULL, an index or a value out of range */
    BRINDLE_ERROR_INPUT = 2,     /**< a text or bytes that are not what they should be */
    BRINDLE_ERROR_FILE = 3,      /**< a file that cannot be read or written */
    BRINDLE_ERROR_NOT_FOUND = 4, /**< what was asked for is not there */
    BRINDLE_ERROR_MEMORY = 5,    /**< the system gives no more of it */
    BRINDLE_ERROR_INTERNAL = 6   /**< a fault of the library */
} brindle_status;

/** What was wrong with the last call of this thread that gave a status; "" if it gave BRINDLE_OK.
 * Valid until the next such call of the thread. */
BRINDLE_API const char* brindle_last_error(void);
/** Where that was in the text that was handed in, in characters (not bytes) from 1; 0 for nowhere.
 */
BRINDLE_API size_t brindle_last_error_position(void);

/** Frees what a `char**` received; NULL is allowed. */
BRINDLE_API void brindle_free(char* text);

/* Set-up, before other threads use the library */

/** Where the data lie that come with the library (the folder with "Chord Grids"); NULL for where
 * they were installed. */
BRINDLE_API brindle_status brindle_set_data_folder(const char* path);
/** The folder with translations, `<language>/LC_MESSAGES/brindle.mo`; texts are in the language
 * that the host has set with setlocale. */
BRINDLE_API brindle_status brindle_set_locale_folder(const char* path);

/** Receives what an import remarks beside its events; it must not throw or jump. */
typedef void (*brindle_alert_handler)(const char* heading, const char* text, void* context);
/** Receives all alerts, on the thread that they come from; NULL for the default, which writes them
 * to standard error. `context` is handed on as it is. */
BRINDLE_API brindle_status brindle_set_alert_handler(brindle_alert_handler handler, void* context);

/* Tones, keys and scales: plain values, which may be copied and made by hand */

/** The accidental of a tone without spelling. */
#define BRINDLE_UNSPELLED 127
/** The pitch class of no tone. */
#define BRINDLE_NONE (-1)

/** A spelled pitch class: {1, 1} is C sharp and {1, -1} is D flat. */
typedef struct brindle_tone {
    int pitch_class; /**< 0 (C) to 11 (B); BRINDLE_NONE for none */
    int accidental;  /**< -3 (triple flat) to 3 (triple sharp), or BRINDLE_UNSPELLED */
} brindle_tone;

/** Which third a key has. */
typedef enum brindle_mode {
    BRINDLE_MODE_NONE = 0, /**< no key */
    BRINDLE_MODE_MAJOR = 1,
    BRINDLE_MODE_MINOR = 2
} brindle_mode;

/** A major or minor key; undefined without tonic or mode. */
typedef struct brindle_key {
    brindle_tone tonic; /**< with or without a spelling */
    int mode;           /**< a brindle_mode */
} brindle_key;

/** The tones of a scale, with or without a name. */
typedef struct brindle_scale {
    brindle_tone root; /**< none for no scale */
    uint32_t mask;     /**< bit n is n semitones above the root, n from 0 to 11 */
} brindle_scale;

/** What tones are called. */
typedef enum brindle_naming {
    BRINDLE_NAMING_LETTERS = 0, /**< C D E F G A B */
    BRINDLE_NAMING_GERMAN = 1,  /**< B is written H, and B flat is B */
    BRINDLE_NAMING_SOLFEGE = 2  /**< Do Re Mi Fa Sol La Si */
} brindle_naming;

/** How names of tones are written. */
typedef struct brindle_style {
    int naming;        /**< a brindle_naming */
    int unicode_signs; /**< not 0: the signs U+266F and U+266D in place of # and b */
} brindle_style;

/** The name of a tone, "Bb". `style` may be NULL for letters in ASCII, here and below. */
BRINDLE_API brindle_status brindle_tone_write(const brindle_tone* tone, const brindle_style* style,
                                              char** text);
/** Reads "F# minor", "Bb", "am". */
BRINDLE_API brindle_status brindle_key_read(const char* text, brindle_key* key);
/** "Bb Minor". */
BRINDLE_API brindle_status brindle_key_write(const brindle_key* key, char** text);
/** Sharps of the signature, flats as a negative number; 0 for NULL and an undefined key. */
BRINDLE_API int brindle_key_signature(const brindle_key* key);
/** The key of the other mode with the same signature: A minor for C major. */
BRINDLE_API brindle_status brindle_key_relative(const brindle_key* key, brindle_key* relative);
/** Major or natural minor. */
BRINDLE_API brindle_status brindle_key_scale(const brindle_key* key, brindle_scale* scale);

/** Reads "D dorian", "Bb blues minor". */
BRINDLE_API brindle_status brindle_scale_read(const char* text, brindle_scale* scale);
/** "D Dorian"; "D Custom" for a scale without a name. */
BRINDLE_API brindle_status brindle_scale_write(const brindle_scale* scale, char** text);
/** The tones from the root up as they are spelled. `tones` has room for 12 and `count` receives how
 * many there are. */
BRINDLE_API brindle_status brindle_scale_tones(const brindle_scale* scale, brindle_tone tones[12],
                                               size_t* count);

/* Chords: plain values */

/** The tones of a chord and its spelling. */
typedef struct brindle_chord {
    brindle_tone root; /**< none for no chord */
    brindle_tone bass; /**< what stands behind the slash; none without one */
    uint32_t mask;     /**< bit n is n semitones above the root, bit 0 the root itself */
} brindle_chord;

/** How a chord symbol is read; to be joined by |. */
enum {
    BRINDLE_READ_B_IS_B_FLAT = 1,     /**< the letter B is B flat, H is B natural */
    BRINDLE_READ_SOLFEGE = 2,         /**< roots may be syllables */
    BRINDLE_READ_LOWER_CASE_MINOR = 4 /**< a root in lower case without a quality is minor */
};

/** Reads a chord symbol as people write it: "F#m7/C#", "Co7", "Ab:min7/b3". "N.C." gives the chord
 * without root. A sign that repeats the chord before is BRINDLE_ERROR_INPUT. */
BRINDLE_API brindle_status brindle_chord_read(const char* symbol, unsigned flags,
                                              brindle_chord* chord);
/** The symbol of a chord as people type it, "E7b9"; it reads back as the same chord. "N.C." for no
 * chord. */
BRINDLE_API brindle_status brindle_chord_write(const brindle_chord* chord,
                                               const brindle_style* style, char** symbol);
/** The tones from the root up as the chord spells them; without a bass that is none of them. */
BRINDLE_API brindle_status brindle_chord_tones(const brindle_chord* chord, brindle_tone tones[12],
                                               size_t* count);

/* Names of notes */

/** The names of some notes, the likeliest first. */
typedef struct brindle_names brindle_names;

/** What the lowest of some notes means for their chord. */
typedef enum brindle_bass_use {
    BRINDLE_BASS_USUAL = 0, /**< the lowest note is the bass, of the chord or foreign to it */
    BRINDLE_BASS_ONLY = 1,  /**< it is only the bass, the chord is above it */
    BRINDLE_BASS_NONE = 2   /**< it says nothing, as on a ukulele */
} brindle_bass_use;

/** What is known about some notes besides themselves. */
typedef struct brindle_naming_options {
    brindle_key key;   /**< of the piece; undefined if it is not known */
    int previous_root; /**< pitch class of the root before, 0 to 11, or BRINDLE_NONE */
    int next_root;     /**< of the root behind, likewise */
    int bass;          /**< a brindle_bass_use */
    size_t limit;      /**< most names that are wanted */
} brindle_naming_options;

/** A name of some notes. The texts belong to the brindle_names. */
typedef struct brindle_name {
    const char* symbol;       /**< "Dm7/C" */
    const char* exact_symbol; /**< the same with all that is left out: "C7(no5)" */
    brindle_chord chord;      /**< its tones are those that sound, without a foreign bass */
    int cost;                 /**< how unusual the name is, in tenths of a bit */
} brindle_name;

/** No key, no neighbours, usual bass, 12 names. */
BRINDLE_API brindle_naming_options brindle_naming_options_default(void);
/** Names notes, MIDI numbers of 0 to 127 in any order, as players say them, the likeliest name
 * first, at most one for each root. `options` may be NULL for the default. Without notes there are
 * no names, which is no error. */
BRINDLE_API brindle_status brindle_names_of_notes(const int* notes, size_t count,
                                                  const brindle_naming_options* options,
                                                  brindle_names** names);
/** NULL is allowed. */
BRINDLE_API void brindle_names_free(brindle_names* names);
/** At most the limit of the options. */
BRINDLE_API size_t brindle_names_count(const brindle_names* names);
/** The name at an index from 0. */
BRINDLE_API brindle_status brindle_names_get(const brindle_names* names, size_t index,
                                             brindle_name* name);

/* Songs */

/** A song with its chords, or with the faults that it has. */
typedef struct brindle_song brindle_song;

/** The forms in which songs are written down. */
typedef enum brindle_format {
    BRINDLE_FORMAT_AUTO = 0,                 /**< whichever of these it looks like */
    BRINDLE_FORMAT_CHORD_TEXT = 1,           /**< Dm7 G7 | C . . . */
    BRINDLE_FORMAT_EVEN_TEXT = 2,            /**< the same, the chords of a bar share it evenly */
    BRINDLE_FORMAT_CHORDS_ABOVE_LYRICS = 3,  /**< a line of chords, the line of lyrics below it */
    BRINDLE_FORMAT_CHORD_PRO = 4,            /**< lyrics with [C], {title: ...} */
    BRINDLE_FORMAT_CHART = 5,                /**< {*AT44C^7 |A-7 D7 } */
    BRINDLE_FORMAT_CHART_LINK = 6,           /**< a link with one or many such charts in it */
    BRINDLE_FORMAT_CHART_PAGE = 7,           /**< a web page with such links */
    BRINDLE_FORMAT_CHORD_STRINGS = 8,        /**< (4,C);(2,G7), one sequence a line */
    BRINDLE_FORMAT_MUSICXML = 9,             /**< a score */
    BRINDLE_FORMAT_COMPRESSED_MUSICXML = 10, /**< the same in a zip container, ".mxl" */
    BRINDLE_FORMAT_ROMAN_TEXT = 11           /**< m1 C: I b3 V65/V */
} brindle_format;

/** How a song is read. */
typedef struct brindle_song_options {
    int format;             /**< a brindle_format */
    double beats_per_bar;   /**< of a text that does not tell; 1/1024 to 1024 */
    double beats_per_chord; /**< how far a chord moves on in such a text; 1/1024 to 1024 */
    int even;               /**< not 0: the chords of a bar without holds share it evenly */
    int lenient;          /**< not 0: what is not understood is left out, and all faults are told */
    unsigned chord_flags; /**< BRINDLE_READ_... */
} brindle_song_options;

/** Any format, 4 beats a bar, 1 beat a chord, strict. */
BRINDLE_API brindle_song_options brindle_song_options_default(void);

/** What is wrong with a song, or was left out of it. */
typedef struct brindle_fault {
    size_t line;      /**< from 1; 0 where it is the whole song */
    size_t column;    /**< in characters from 1 */
    int is_note;      /**< not 0: all chords are there, something else was left out */
    const char* text; /**< what is wrong, a line for people; belongs to the song */
} brindle_fault;

/** A chord of a song where it sounds. */
typedef struct brindle_song_chord {
    double position;     /**< in beats, ascending in a song */
    double length;       /**< in beats, up to the next chord or the end */
    const char* symbol;  /**< as it was written; belongs to the song */
    brindle_chord chord; /**< without root where no chord sounds */
} brindle_song_chord;

/** A bar as it is played; one that is played twice stands twice. */
typedef struct brindle_bar {
    const char* number;   /**< as printed, "12" */
    double position;      /**< in beats */
    double length;        /**< in beats; of an upbeat as long as it is written */
    int time_numerator;   /**< 3 of 3/4; 0 where the song does not tell */
    int time_denominator; /**< 4 of 3/4; 0 where the song does not tell */
} brindle_bar;

/** A part of a song: a rehearsal mark, a verse, a chorus. */
typedef struct brindle_section {
    const char* name; /**< may be "" */
    double position;  /**< where it begins, in beats */
} brindle_section;

/** Reads a song in any form, played through its repeats, endings and jumps. Bytes that make no
 * sense are no error: their song has faults, and without BRINDLE_OK there is no song. Of a source
 * with many songs it is the first. `options` may be NULL for the default, `bytes` if `size` is 0.
 */
BRINDLE_API brindle_status brindle_song_read(const void* bytes, size_t size,
                                             const brindle_song_options* options,
                                             brindle_song** song);
/** The same for a file. One that cannot be read or is larger than 256 MiB is a fault of the song.
 */
BRINDLE_API brindle_status brindle_song_read_file(const char* path,
                                                  const brindle_song_options* options,
                                                  brindle_song** song);
/** NULL is allowed; texts of the song are freed with it. */
BRINDLE_API void brindle_song_free(brindle_song* song);

/** Not 0 if there is a fault that is no note; the song then has no chords, unless it was read
 * leniently. */
BRINDLE_API int brindle_song_has_fault(const brindle_song* song);
/** Faults and notes together. */
BRINDLE_API size_t brindle_song_fault_count(const brindle_song* song);
/** The fault at an index from 0, by their places. */
BRINDLE_API brindle_status brindle_song_fault(const brindle_song* song, size_t index,
                                              brindle_fault* fault);
/** What it was read as, never BRINDLE_FORMAT_AUTO but for NULL. */
BRINDLE_API brindle_format brindle_song_format(const brindle_song* song);
/** "" where the song tells none; so for the next two. */
BRINDLE_API const char* brindle_song_title(const brindle_song* song);
/** Composers, artists and writers of the words. */
BRINDLE_API const char* brindle_song_makers(const brindle_song* song);
/** Such as "Medium Swing"; words of the song. */
BRINDLE_API const char* brindle_song_style(const brindle_song* song);
/** The first key that the song states; BRINDLE_ERROR_NOT_FOUND if it states none. */
BRINDLE_API brindle_status brindle_song_stated_key(const brindle_song* song, brindle_key* key);
/** Quarter notes a minute; 0 where the song does not tell. */
BRINDLE_API double brindle_song_tempo(const brindle_song* song);
/** Length of a bar by the first time signature, else that of the options or of most bars. */
BRINDLE_API double brindle_song_beats_per_bar(const brindle_song* song);
/** Without the end. */
BRINDLE_API size_t brindle_song_chord_count(const brindle_song* song);
/** The chord at an index from 0. */
BRINDLE_API brindle_status brindle_song_chord_at(const brindle_song* song, size_t index,
                                                 brindle_song_chord* chord);
/** As played; 0 for a text without bar lines. */
BRINDLE_API size_t brindle_song_bar_count(const brindle_song* song);
/** The bar at an index from 0. */
BRINDLE_API brindle_status brindle_song_bar(const brindle_song* song, size_t index,
                                            brindle_bar* bar);
/** As played; 0 for a song without marks. */
BRINDLE_API size_t brindle_song_section_count(const brindle_song* song);
/** The section at an index from 0. */
BRINDLE_API brindle_status brindle_song_section(const brindle_song* song, size_t index,
                                                brindle_section* section);

/** The song so many semitones higher, or lower for a negative number, spelled for the key in which
 * it then is, with new symbols. */
BRINDLE_API brindle_status brindle_song_transpose(const brindle_song* song, int semitones,
                                                  brindle_song** transposed);
/** The same song with the symbols of its chords written in a style; `style` may be NULL. */
BRINDLE_API brindle_status brindle_song_rename(const brindle_song* song, const brindle_style* style,
                                               brindle_song** renamed);
/** The song in ChordPro, its chords as a grid, as they are played; "" for a song without chords or
 * with more than a million steps of that grid. */
BRINDLE_API brindle_status brindle_song_chord_pro(const brindle_song* song, char** text);
/** The chords and their bass as a Standard MIDI File of `midi_size` bytes; `tempo` is beats a
 * minute, 1 to 1000, 0 for that of the song or 120. */
BRINDLE_API brindle_status brindle_song_midi(const brindle_song* song, double tempo, char** midi,
                                             size_t* midi_size);

/* Analysis */

/** What was found in a song. */
typedef struct brindle_analysis brindle_analysis;

/** What an analysis has beside keys, centers and the reading; to be joined by |. */
enum {
    BRINDLE_ANALYSE_ALTERNATIVES = 1, /**< all readings that progressions to a tonic allow */
    BRINDLE_ANALYSE_COPIES = 2,       /**< passages that repeat earlier ones */
    BRINDLE_ANALYSE_EXPLAIN = 4       /**< a sentence for each chord */
};

/** What is asked of an analysis. */
typedef struct brindle_analysis_options {
    brindle_key stated_key; /**< instead of what the song states; undefined for that */
    unsigned flags;         /**< BRINDLE_ANALYSE_... */
} brindle_analysis_options;

/** Where a chord stands in its key. */
typedef enum brindle_function {
    BRINDLE_FUNCTION_UNDEFINED = 0,   /**< no chord */
    BRINDLE_FUNCTION_TONIC = 1,       /**< it rests */
    BRINDLE_FUNCTION_SUBDOMINANT = 2, /**< it leads away */
    BRINDLE_FUNCTION_DOMINANT = 3,    /**< it leads back */
    BRINDLE_FUNCTION_NONE = 4         /**< a chord that only passes by */
} brindle_function;

/** What a chord is to the chords around it. */
typedef enum brindle_relation {
    BRINDLE_RELATION_UNDEFINED = 0,              /**< no chord */
    BRINDLE_RELATION_NONE = 1,                   /**< a chord of the key */
    BRINDLE_RELATION_TONIC = 2,                  /**< C in C major, as all examples here */
    BRINDLE_RELATION_DOMINANT = 3,               /**< G7; A7 before Dm, C/G before G7 */
    BRINDLE_RELATION_RELATED_SECOND = 4,         /**< Dm7 before G7, Em7b5 before A7 */
    BRINDLE_RELATION_SUBSTITUTE_DOMINANT = 5,    /**< Db7 before C, a tritone away from G7 */
    BRINDLE_RELATION_LEADING_DIMINISHED = 6,     /**< Bo7 before C */
    BRINDLE_RELATION_PASSING_DIMINISHED = 7,     /**< C#o7 between C and Dm */
    BRINDLE_RELATION_COMMON_TONE_DIMINISHED = 8, /**< Co7 between C and C */
    BRINDLE_RELATION_BACKDOOR = 9,               /**< Bb7 before C, Fm7 before that Bb7 */
    BRINDLE_RELATION_PLAGAL = 10,                /**< F before C */
    BRINDLE_RELATION_BORROWED = 11,              /**< Fm, from C minor */
    BRINDLE_RELATION_CHROMATIC_MEDIANT = 12,     /**< E, Ab */
    BRINDLE_RELATION_NEAPOLITAN = 13,            /**< Db/F */
    BRINDLE_RELATION_AUGMENTED_SIXTH = 14,       /**< Ab7 before G */
    BRINDLE_RELATION_BLUES = 15,                 /**< C7 and F7, at rest */
    BRINDLE_RELATION_LINE_CLICHE = 16            /**< Am^7 and Am7 in Am Am^7 Am7 Am6 */
} brindle_relation;

/** One chord as a teacher reads it. Texts belong to the analysis; indices are those of chords, -1
 * for none. */
typedef struct brindle_chord_reading {
    double position;         /**< in beats */
    double length;           /**< in beats */
    const char* symbol;      /**< as it was written */
    brindle_chord chord;     /**< without root where no chord sounds */
    brindle_key key;         /**< of its passage; undefined for no chord */
    const char* numeral;     /**< in that key: "V7/ii"; "" for no chord */
    int function;            /**< a brindle_function */
    int relation;            /**< a brindle_relation */
    int64_t resolves_to;     /**< the chord that it leads to */
    int64_t under;           /**< the later chord that it stands under in the tree of the song */
    int is_deceptive;        /**< not 0: a dominant that goes to vi in place of its tonic */
    const char* explanation; /**< "" unless it was asked for */
} brindle_chord_reading;

/** A passage in one key. */
typedef struct brindle_region {
    brindle_key key;    /**< of all its chords */
    double position;    /**< in beats */
    double end;         /**< in beats; the next region begins there */
    size_t first_chord; /**< index of a chord */
    size_t chord_count; /**< from that one on */
} brindle_region;

/** A harmonic center that stated progressions lead to. */
typedef struct brindle_center {
    brindle_scale scale; /**< root and mode of what is heard as home */
    double position;     /**< in beats */
    size_t chord_count;  /**< chords that it holds */
} brindle_center;

/** The pictures of an analysis. */
typedef enum brindle_picture {
    BRINDLE_PICTURE_LEAD_SHEET = 0, /**< bars with symbols, numerals, keys and arrows */
    BRINDLE_PICTURE_TIME_AXIS = 1   /**< chords, centers and keys along a time axis */
} brindle_picture;

/** "tonic", "related second" and so on for a brindle_function and a brindle_relation; "" for what
 * is undefined. */
BRINDLE_API const char* brindle_function_name(int function);
/** Likewise of a brindle_relation. */
BRINDLE_API const char* brindle_relation_name(int relation);

/** Analyses a song; `options` may be NULL for no stated key and no flags. Linear in the length of
 * the song but for alternatives and copies. */
BRINDLE_API brindle_status brindle_analyse(const brindle_song* song,
                                           const brindle_analysis_options* options,
                                           brindle_analysis** analysis);
/** NULL is allowed; texts of the analysis are freed with it. */
BRINDLE_API void brindle_analysis_free(brindle_analysis* analysis);
/** BRINDLE_ERROR_NOT_FOUND for a song without chords. */
BRINDLE_API brindle_status brindle_analysis_key(const brindle_analysis* analysis, brindle_key* key);
/** How sure the key is against the 23 others (softmax of their points), 0 to 1; -1 without a key.
 */
BRINDLE_API double brindle_analysis_confidence(const brindle_analysis* analysis);
/** Those of the song, without the end. */
BRINDLE_API size_t brindle_analysis_chord_count(const brindle_analysis* analysis);
/** The reading of the chord at an index from 0. */
BRINDLE_API brindle_status brindle_analysis_chord(const brindle_analysis* analysis, size_t index,
                                                  brindle_chord_reading* chord);
/** Regions follow each other without a gap. */
BRINDLE_API size_t brindle_analysis_region_count(const brindle_analysis* analysis);
/** The region at an index from 0. */
BRINDLE_API brindle_status brindle_analysis_region(const brindle_analysis* analysis, size_t index,
                                                   brindle_region* region);
/** Those that are defined, of all key signatures. */
BRINDLE_API size_t brindle_analysis_center_count(const brindle_analysis* analysis);
/** The center at an index from 0. */
BRINDLE_API brindle_status brindle_analysis_center(const brindle_analysis* analysis, size_t index,
                                                   brindle_center* center);
/** As strict JSON, the same as the program prints for a chord text. */
BRINDLE_API brindle_status brindle_analysis_json(const brindle_analysis* analysis, char** text);
/** As text for people, in lines of 80 characters. */
BRINDLE_API brindle_status brindle_analysis_text(const brindle_analysis* analysis, char** text);
/** As a picture, a file in SVG; `picture` is a brindle_picture. */
BRINDLE_API brindle_status brindle_analysis_svg(const brindle_analysis* analysis, int picture,
                                                char** text);

/** What stands for the chords of a lead sheet. */
typedef enum brindle_chord_naming {
    BRINDLE_CHORDS_AS_WRITTEN = 0, /**< the symbols of the song */
    BRINDLE_CHORDS_IN_STYLE = 1,   /**< symbols in a style */
    BRINDLE_CHORDS_NASHVILLE = 2,  /**< numbers in the key of each passage: 2-7 57 1 */
    BRINDLE_CHORDS_ROMAN = 3       /**< numerals in it: ii7 V7 I */
} brindle_chord_naming;

/** The colors of a lead sheet. */
typedef enum brindle_theme {
    BRINDLE_THEME_AUTO = 0, /**< those that the viewer prefers */
    BRINDLE_THEME_LIGHT = 1,
    BRINDLE_THEME_DARK = 2
} brindle_theme;

/** How a lead sheet is drawn. Numbers beyond their ranges count as the nearer end. */
typedef struct brindle_sheet_options {
    int naming;          /**< a brindle_chord_naming */
    brindle_style style; /**< of BRINDLE_CHORDS_IN_STYLE */
    int bars_per_line;   /**< 1 to 16; fewer where they do not fit */
    int theme;           /**< a brindle_theme */
    double width;        /**< 200 to 4000 pixels */
} brindle_sheet_options;

/** As written, 4 bars a line, the colors of the viewer, 800 pixels. */
BRINDLE_API brindle_sheet_options brindle_sheet_options_default(void);
/** The lead sheet, a file in SVG; `options` may be NULL for the default. */
BRINDLE_API brindle_status brindle_analysis_sheet(const brindle_analysis* analysis,
                                                  const brindle_sheet_options* options,
                                                  char** text);
/** What that lead sheet shows, for hosts that draw it themselves, as strict JSON; of the options
 * the naming alone counts. `options` may be NULL for the default. */
BRINDLE_API brindle_status brindle_analysis_sheet_json(const brindle_analysis* analysis,
                                                       const brindle_sheet_options* options,
                                                       char** text);
/** How a lead sheet sets a chord symbol, or a numeral if `is_numeral` is not 0, for hosts that draw
 * it themselves: a JSON array of pieces, [text, size, base line above that of the whole], in em. */
BRINDLE_API brindle_status brindle_text_runs_json(const char* symbol, int is_numeral, char** text);
/** What stands for the chords, a line for each; `naming` is a brindle_chord_naming and `style`,
 * which may be NULL, that of BRINDLE_CHORDS_IN_STYLE. What sounds no chord keeps its symbol. */
BRINDLE_API brindle_status brindle_analysis_symbols(const brindle_analysis* analysis, int naming,
                                                    const brindle_style* style, char** lines);

/* Fingerings of guitars and their like */

/** Libraries of fingerings, to be searched. */
typedef struct brindle_grid_package brindle_grid_package;
/** Fingerings of one chord, the best first. */
typedef struct brindle_grids brindle_grids;

/** Strings that a brindle_grid has room for. */
#define BRINDLE_MAX_STRINGS 16

/** A fingering and what it sounds. */
typedef struct brindle_grid {
    const char* name;                 /**< told from what sounds: "Am7" */
    const char* library;              /**< where it comes from; "" for typed frets */
    int capo;                         /**< its fret, 0 without one */
    size_t string_count;              /**< how many entries of the two lists count */
    int frets[BRINDLE_MAX_STRINGS];   /**< from the lowest string: -1 muted, 0 open */
    int pitches[BRINDLE_MAX_STRINGS]; /**< MIDI numbers; -1 muted */
} brindle_grid;

/** Reads a package of fingerings; NULL as the path is the one that comes with the library. */
BRINDLE_API brindle_status brindle_grid_package_read(const char* path,
                                                     brindle_grid_package** package);
/** NULL is allowed. */
BRINDLE_API void brindle_grid_package_free(brindle_grid_package* package);
/** The fingerings of a chord symbol. `tuning` is written as "DADGAD" or "E2A2D3G3B3E4", NULL for
 * the standard guitar; the capo is a fret of 0 to 24. That there are none is no error. */
BRINDLE_API brindle_status brindle_grids_find(brindle_grid_package* package, const char* symbol,
                                              const char* tuning, int capo, brindle_grids** grids);
/** The chord of typed frets, "x32010" or "x-10-12-12-11-10", as one grid. */
BRINDLE_API brindle_status brindle_grids_of_frets(const char* frets, const char* tuning, int capo,
                                                  brindle_grids** grids);
/** NULL is allowed; texts of the grids are freed with it. */
BRINDLE_API void brindle_grids_free(brindle_grids* grids);
/** 0 if none was found. */
BRINDLE_API size_t brindle_grids_count(const brindle_grids* grids);
/** The fingering at an index from 0. */
BRINDLE_API brindle_status brindle_grids_get(const brindle_grids* grids, size_t index,
                                             brindle_grid* grid);

/** What the lowest note of a searched fingering has to be. */
typedef enum brindle_lowest {
    BRINDLE_LOWEST_USUAL = 0,    /**< what stands behind a slash, else preferably the root */
    BRINDLE_LOWEST_REQUIRED = 1, /**< what stands behind a slash, else the root */
    BRINDLE_LOWEST_FREE = 2      /**< any tone of the chord */
} brindle_lowest;

/** What stands on the dots of a diagram. */
typedef enum brindle_dots {
    BRINDLE_DOTS_FINGERS = 0,  /**< 1 index to 4 little finger */
    BRINDLE_DOTS_NOTES = 1,    /**< "F#" */
    BRINDLE_DOTS_INTERVALS = 2 /**< degrees as the chord names them, "b3" */
} brindle_dots;

/** What a hand and its player allow. */
typedef struct brindle_fingering_options {
    const char* tuning; /**< as for brindle_grids_find, or a name, "drop d"; NULL for the guitar */
    int capo;           /**< a fret of 0 to 24; frets are counted from it */
    int highest_fret;   /**< last fret of the neck, 1 to 24 */
    int span;           /**< frets under the hand, 2 to 6; one more from the seventh fret on */
    int lowest;         /**< a brindle_lowest */
    int whole;          /**< not 0: nothing is left out */
    int rootless;       /**< not 0: the root may be left to a bass player */
    size_t limit;       /**< most fingerings of a chord, 1 to 1000 */
} brindle_fingering_options;

/** Standard guitar without a capo, fret 15, span 4, usual bass, 10 fingerings. */
BRINDLE_API brindle_fingering_options brindle_fingering_options_default(void);
/** Searches the fingerings of a chord symbol, the best first, without a package. `options` may be
 * NULL for the default, here and below. That there are none is no error. */
BRINDLE_API brindle_status brindle_grids_search(const char* symbol,
                                                const brindle_fingering_options* options,
                                                brindle_grids** grids);
/** The fingerings of a song that are easy and near each other, each different one once. With a
 * `highest_capo` of 0 to 12 the capo lies where the song is easiest up to that fret; with -1 at the
 * fret of the options. The names are those of the shapes under the capo. */
BRINDLE_API brindle_status brindle_grids_of_song(const brindle_song* song,
                                                 const brindle_fingering_options* options,
                                                 int highest_capo, brindle_grids** grids);
/** The same as strict JSON, with what each fret of the capo makes of the song and the fingering of
 * each chord, as the program prints it. */
BRINDLE_API brindle_status brindle_song_grids_json(const brindle_song* song,
                                                   const brindle_fingering_options* options,
                                                   int highest_capo, char** text);

/** As strict JSON, the same as the program prints for fingerings. */
BRINDLE_API brindle_status brindle_grids_json(const brindle_grids* grids, char** text);
/** A sheet of diagrams under a title, a file in SVG. */
BRINDLE_API brindle_status brindle_grids_svg(const brindle_grids* grids, const char* title,
                                             char** text);
/** The same with a brindle_dots on the dots, and for the left hand if that is not 0. */
BRINDLE_API brindle_status brindle_grids_draw(const brindle_grids* grids, const char* title,
                                              int dots, int left_handed, char** text);

/* Markov models of chord sequences */

/** A model of which chords follow which, and how long. */
typedef struct brindle_markov brindle_markov;

/** What sequence is wanted. */
typedef struct brindle_markov_options {
    double beats;     /**< length of the sequence, 1 to 10000 */
    uint64_t seed;    /**< the same seed and model give the same sequence */
    size_t max_order; /**< longest history; 0 for that of the model */
    size_t samples;   /**< sequences to choose from, 1 to 100000 */
} brindle_markov_options;

/** 32 beats, seed 0, the order of the model, 10 samples. */
BRINDLE_API brindle_markov_options brindle_markov_options_default(void);
/** An empty model with histories of 1 to `order` chords; the order is 1 to 64. */
BRINDLE_API brindle_status brindle_markov_new(size_t order, brindle_markov** model);
/** NULL is allowed. */
BRINDLE_API void brindle_markov_free(brindle_markov* model);
/** Learns the chords of a song, cut where there is no chord. BRINDLE_ERROR_INPUT for a song with a
 * fault or without chords. */
BRINDLE_API brindle_status brindle_markov_learn(brindle_markov* model, const brindle_song* song);
/** Different symbols that the model holds: chords with their lengths, marks of begin and end.
 * Generating may add the gap that it fills. */
BRINDLE_API size_t brindle_markov_symbol_count(const brindle_markov* model);
/** Chords of its longest history; 0 for NULL. */
BRINDLE_API size_t brindle_markov_order(const brindle_markov* model);
/** The model of a text that brindle_markov_write gave. */
BRINDLE_API brindle_status brindle_markov_read(const char* text, brindle_markov** model);
/** The same from a file. */
BRINDLE_API brindle_status brindle_markov_read_file(const char* path, brindle_markov** model);
/** The text of a model file. */
BRINDLE_API brindle_status brindle_markov_write(const brindle_markov* model, char** text);
/** Replaces the file as a whole. */
BRINDLE_API brindle_status brindle_markov_write_file(const brindle_markov* model, const char* path);
/** A new sequence in the manner of what was learned, as a chord string that brindle_song_read
 * reads: "(4,C);(2,G7)". `options` may be NULL for the default. BRINDLE_ERROR_NOT_FOUND if the
 * model has no sequence of that length. */
BRINDLE_API brindle_status brindle_markov_generate(brindle_markov* model,
                                                   const brindle_markov_options* options,
                                                   char** chords);

/* Models of songs: what may come next, and new songs */

/** What songs have in common: which chord follows which in a key, where in the bar and how long. A
 * model never changes and may be asked by several threads. */
typedef struct brindle_song_model brindle_song_model;

/** The model of the songs that come with the library, all or those of a style ("Hymn"); `style` may
 * be NULL. BRINDLE_ERROR_NOT_FOUND for a style that none of them has. */
BRINDLE_API brindle_status brindle_song_model_built_in(const char* style,
                                                       brindle_song_model** model);
/** The model of `count` songs. BRINDLE_ERROR_INPUT for none, and for one with a fault or without
 * chords. */
BRINDLE_API brindle_status brindle_song_model_learn(const brindle_song* const* songs, size_t count,
                                                    brindle_song_model** model);
/** The model of the songs of both: so one learns more, or is joined with what is built in. */
BRINDLE_API brindle_status brindle_song_model_join(const brindle_song_model* model,
                                                   const brindle_song_model* other,
                                                   brindle_song_model** joined);
/** The model of those of its songs that have a style, in small or capital letters.
 * BRINDLE_ERROR_NOT_FOUND if none has. */
BRINDLE_API brindle_status brindle_song_model_of_style(const brindle_song_model* model,
                                                       const char* style,
                                                       brindle_song_model** of_style);
/** NULL is allowed. */
BRINDLE_API void brindle_song_model_free(brindle_song_model* model);
/** Its songs, each with chords. */
BRINDLE_API size_t brindle_song_model_song_count(const brindle_song_model* model);
/** The chords of all its songs together. */
BRINDLE_API size_t brindle_song_model_chord_count(const brindle_song_model* model);
/** Its songs with their makers, styles and keys, as strict JSON, the same as the program prints. */
BRINDLE_API brindle_status brindle_song_model_songs_json(const brindle_song_model* model,
                                                         char** text);
/** How well it foretells songs, in bits a chord for histories of each length, as strict JSON, the
 * same as the program prints. With a `count` of 0, where `songs` may be NULL, its own songs, each
 * without what it told the model. */
BRINDLE_API brindle_status brindle_song_model_score_json(const brindle_song_model* model,
                                                         const brindle_song* const* songs,
                                                         size_t count, char** text);
/** The model of a text that brindle_song_model_write gave. BRINDLE_ERROR_INPUT for any other text,
 * one of another version and a damaged one. */
BRINDLE_API brindle_status brindle_song_model_read(const char* text, brindle_song_model** model);
/** The same from a file. */
BRINDLE_API brindle_status brindle_song_model_read_file(const char* path,
                                                        brindle_song_model** model);
/** The text of a model file, which the program reads, too. */
BRINDLE_API brindle_status brindle_song_model_write(const brindle_song_model* model, char** text);
/** Replaces the file as a whole. */
BRINDLE_API brindle_status brindle_song_model_write_file(const brindle_song_model* model,
                                                         const char* path);

/** What is asked of the next chord. */
typedef struct brindle_next_options {
    brindle_key key; /**< in which the chords are; undefined to find it */
    size_t limit;    /**< most chords that are wanted */
    int place;       /**< where it begins: 0 to 3 on the first beat of the first to fourth of four
                          bars, 4 in the middle of a bar, 5 elsewhere */
    size_t order;    /**< most chords before that are looked at, 1 to 5 */
} brindle_next_options;

/** A key to be found, 10 chords, the first beat of a first bar, 5 chords before. */
BRINDLE_API brindle_next_options brindle_next_options_default(void);
/** The chords that may come behind `count` chords, the likeliest first, with their probability,
 * numeral and function; behind none, what a song in the key begins with. As strict JSON, the same
 * as the program prints. `options` may be NULL for the default. */
BRINDLE_API brindle_status brindle_song_model_next_json(const brindle_song_model* model,
                                                        const brindle_chord* chords, size_t count,
                                                        const brindle_next_options* options,
                                                        char** text);

/** What song is to be written. NULL in place of a text asks for nothing, and so does "". */
typedef struct brindle_write_options {
    brindle_key key;         /**< of the song; its parts may leave it */
    const char* form;        /**< a letter for each part, "AABA", or "blues" */
    size_t bars;             /**< 1 to 256; 0 for those of the sheet or the usual ones, 12 or 32 */
    int beats_per_bar;       /**< 1 to 24 */
    const char* sheet;       /**< chords that are fixed, and _ for gaps: "C . Am . | _ | G7" */
    const char* begins;      /**< the first chord, or its numeral */
    const char* ends;        /**< the last one; a chord on the tonic if it is not told */
    const char* contains;    /**< rows of chords that stand somewhere, "ii-V-I of F", between ; */
    const char* never;       /**< chords or numerals that do not occur */
    double most_quoted_bars; /**< longest passage that may stand just so in a song of the model, 0
                                  to 1000; 0 for any */
    size_t order;            /**< longest history, 1 to 5 chords */
    uint64_t seed;           /**< the same seed, model and wishes give the same song */
} brindle_write_options;

/** C major, 4 beats a bar, 4 bars of quotes, histories of 5 chords, seed 0, and no wishes. */
BRINDLE_API brindle_write_options brindle_write_options_default(void);
/** Writes a new song in the manner of a model; a blues after its songs of that style, if it has
 * any. `json`, which may be NULL, receives the song as strict JSON, the same as the program prints,
 * with its longest quote. `options` may be NULL for the default. BRINDLE_ERROR_ARGUMENT for a
 * number out of range, BRINDLE_ERROR_INPUT for wishes that are not understood, and
 * BRINDLE_ERROR_NOT_FOUND if there is no such song; the error names a smallest set of wishes that
 * contradict each other. */
BRINDLE_API brindle_status brindle_song_model_write_song(const brindle_song_model* model,
                                                         const brindle_write_options* options,
                                                         brindle_song** song, char** json);

/* Scores in MusicXML, plain or compressed */

/** The notes of a score and what stands between them, a JSON object a line. */
BRINDLE_API brindle_status brindle_score_json_lines(const void* bytes, size_t size, char** lines);
/** The notes of a score as a Standard MIDI File of `midi_size` bytes. */
BRINDLE_API brindle_status brindle_score_midi(const void* bytes, size_t size, char** midi,
                                              size_t* midi_size);

#ifdef __cplusplus
}
#endif

#endif

// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/MusicXmlParserDelegate.h"
#include "brindle/platform/Error.h"

#include <cstdint>
#include <filesystem>
#include <memory>
#include <optional>
#include <string>
#include <string_view>

namespace brindle {

/// The ending of the names of compressed files.
inline constexpr const char* kMusicXMLFileExtCompressed_mxl = "mxl";

/// What a host may set. No step of the import reads it.
struct TMusicXmlParserSettings {
    bool ImportCueNotes = false;  ///< cue notes are always told, and take no time
};

/// Imports a MusicXML score, plain or compressed, as timed notes and what stands between them. A
/// host gives a record of methods, which are called in the order of the score, on the caller's
/// thread, before the call returns.
///
/// Only one import may run at a time in a process, as the temporary file of compressed scores has a
/// fixed name. The limits of an import are in MuxmlLimits.h.
class MusicXmlParser {
public:
    TMusicXmlParserSettings Settings;  ///< stored for the host, without effect
    bool Trace = false;                ///< handed on to all delegates; nothing looks at it
    /// The unit of all times that the host is told; below 1 all lengths are 0.
    std::int32_t MidiTicksPerQuarter = 960;
    /// Receiver of the calls; not owned.
    std::weak_ptr<const brindle::MusicXmlParserDelegate> MusicXmlParserDelegate;

    /// `parseURL:withDelegate:error:` Imports the file at the path. False when that failed; then
    /// the error is stored, if there is a place for it. A file that is not well-formed fails before
    /// the first call to the host.
    ///
    /// Throws boost::bad_rational at the first note after divisions of 0, and what the host throws.
    /// Such divisions, and what the stream finds at fault, are shown as alerts, too: by default on
    /// standard error, see SetAlertHandler. ImportScore makes an error of the divisions.
    bool parseURL(const std::filesystem::path& url,
                  const std::shared_ptr<const brindle::MusicXmlParserDelegate>& delegate,
                  Error* error = nullptr);

    /// Imports the bytes of a file that is not compressed; otherwise as parseURL.
    bool parseBytes(std::string_view bytes,
                    const std::shared_ptr<const brindle::MusicXmlParserDelegate>& delegate,
                    Error* error = nullptr);

    /// `wrapCompressedMusicXMLFile:` For a path that ends in ".mxl": unpacks the score to the file
    /// "ThornbankMusicXMLImport.xml" in the folder for temporary files, which only its owner may
    /// read, and puts the path of that file in place of the given one. Does nothing otherwise.
    std::optional<Error> wrapCompressedMusicXMLFile(std::filesystem::path* url);

    /// The score in the bytes of a compressed file; the error when there is none.
    static std::optional<Error> unpackCompressedMusicXML(std::string_view bytes,
                                                         std::string& score);

    /// `assignLocalError:toOutError:` Stores the error, if there is a place for it. Always false.
    static bool assignLocalError(const Error& error, Error* outError);

private:
    /// What was unpacked by the last call of wrapCompressedMusicXMLFile. It is read from here, as
    /// others might have replaced the temporary file.
    std::optional<std::string> mUnpackedBytes;
};

}  // namespace brindle

// SPDX-License-Identifier: MIT
#include "brindle/musicxml/MuxmlJsonLines.h"

#include "brindle/platform/JsonString.h"

#include <string_view>
#include <tuple>
#include <utility>

namespace brindle {

namespace {

class CLines {
public:
    CLines(TMuxmlEnumForm form, std::function<void(const std::string&)> write)
        : mJson(form), mWrite(std::move(write)) {}

    /// A method whose argument is a record.
    template <class Record>
    [[nodiscard]] std::function<void(const Record&)> OfRecord(std::string_view call) const {
        return [*this, call](const Record& record) {
            std::string line = Begin(call);
            mJson.AppendFields(line, record);
            mWrite(line += '}');
        };
    }

    /// A method with values.
    template <class... Values>
    void WriteValues(std::string_view call, const Values&... values) const {
        std::string line = Begin(call);
        if constexpr (sizeof...(values) > 0) {
            line += ",\"in\":";
            mJson.AppendValue(line, std::tuple(values...));
        }
        mWrite(line += '}');
    }

private:
    [[nodiscard]] static std::string Begin(std::string_view call) {
        std::string line = R"({"call":)";
        CMuxmlJson::Append(line, call);
        return line;
    }

    CMuxmlJson mJson;
    std::function<void(const std::string&)> mWrite;
};

}  // namespace

MusicXmlParserDelegate MuxmlJsonLines(TMuxmlEnumForm form,
                                      std::function<void(const std::string&)> write) {
    const CLines lines(form, std::move(write));
    const auto ofThree = [&lines](std::string_view call) {
        return [lines, call](std::int32_t position, std::int32_t kind, std::int32_t value) {
            lines.WriteValues(call, position, kind, value);
        };
    };
    MusicXmlParserDelegate host;
    host.didEncounterDocumentStartWithProgressBarInfo = [lines](const TMuxmlProgressBarInfo& info) {
        lines.WriteValues("didEncounterDocumentStartWithProgressBarInfo", info.mPartCount);
    };
    host.didEncounterDocumentEnd = [lines] { lines.WriteValues("didEncounterDocumentEnd"); };
    host.didEncounterPartStart = lines.OfRecord<CMuxmlPart>("didEncounterPartStart");
    host.didEncounterPartEnd = lines.OfRecord<CMuxmlPartGatheredInfo>("didEncounterPartEnd");
    host.didEncounterMeasureStart = [lines](std::int32_t barStart) {
        lines.WriteValues("didEncounterMeasureStart", barStart);
    };
    host.didEncounterMeasureEnd = lines.OfRecord<CMuxmlMeasure>("didEncounterMeasureEnd");
    host.didEncounterSignTime = lines.OfRecord<CMuxmlSignTime>("didEncounterSignTime");
    host.didEncounterSignKey = lines.OfRecord<CMuxmlSignKey>("didEncounterSignKey");
    host.didEncounterClef = lines.OfRecord<CMuxmlClef>("didEncounterClef");
    host.didEncounterTranspose = lines.OfRecord<CMuxmlTranspose>("didEncounterTranspose");
    host.didEncounterTempoChange = [lines](const CMuxmlTempoChange& change) {
        lines.WriteValues("didEncounterTempoChange", change.mPositionAsMidiTicks, change.mTempo);
    };
    host.didEncounterInstrumentWithName = [lines](std::string_view name, std::int32_t channel) {
        lines.WriteValues("didEncounterInstrumentWithName", name, channel);
    };
    host.didEncounterNote = lines.OfRecord<CMuxmlNote>("didEncounterNote");
    host.didEncounterDirection = lines.OfRecord<CPositionedXMLElement>("didEncounterDirection");
    host.didEncounterCtrChangePedal = ofThree("didEncounterCtrChangePedal");
    host.didEncounterCtrChangeVol = ofThree("didEncounterCtrChangeVol");
    host.didEncounterCtrChangeBank = ofThree("didEncounterCtrChangeBank");
    host.didEncounterCtrChangePrg = ofThree("didEncounterCtrChangePrg");
    return host;
}

std::string MuxmlResultLine(bool isOk, const Error& error) {
    if (isOk) return R"({"call":"result","ok":true})";
    return R"({"call":"result","ok":false,"domain":)" + JsonString(error.domain) + R"(,"code":)" +
           std::to_string(error.code) + R"(,"description":)" + JsonString(error.description) + '}';
}

}  // namespace brindle

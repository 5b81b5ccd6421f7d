// SPDX-License-Identifier: MIT
#include "brindle/present/PrintableSong.h"

#include "brindle/present/ShownText.h"
#include "brindle/song/CSong.h"

#include <string>

namespace brindle {
namespace {

void MakeTextPrintable(std::string& text) {
    text = Printable(text);
}

}  // namespace

void MakePrintable(CSong& song) {
    for (std::string* const text : {&song.mTitle, &song.mMakers, &song.mStyle}) {
        MakeTextPrintable(*text);
    }
    for (std::string& symbol : song.mSymbols) MakeTextPrintable(symbol);
    for (CSongBar& bar : song.mBars) {
        MakeTextPrintable(bar.mNumber);
        MakeTextPrintable(bar.mWords);
    }
    for (CSongSection& section : song.mSections) MakeTextPrintable(section.mName);
    for (CSongFault& fault : song.mFaults) MakeTextPrintable(fault.mText);
}

}  // namespace brindle

#include "project/CHelpPrjCheckSums.h"

#include "foundation/ErrorTrap.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "project/SitemapText.h"

#include <array>
#include <cstdint>

namespace tovimar {

namespace {

/// Lines without their ends; both kinds of line end count.
std::vector<std::string> LinesOf(const std::string& text) {
    std::vector<std::string> lines;
    for (auto& line : text::Split(text, "\n")) {
        if (!line.empty() && line.back() == '\r')
            line.pop_back();
        lines.push_back(std::move(line));
    }
    return lines;
}

} // namespace

std::string CHelpPrjFileCheckSum::FullPath() const {
    return platform::WithTrailingBackslash(folder_) + FileName;
}

bool CHelpPrjFileCheckSum::CheckSumChanged() const {
    return !text::EqualsIgnoringCase(CurrentCheckSum, SavedCheckSum);
}

bool CHelpPrjFileCheckSum::PreviousCheckSumChanged() const {
    return !text::EqualsIgnoringCase(CurrentCheckSum, PreviousCheckSum);
}

CHelpPrjFileCheckSum* CHelpPrjCheckSums::GetItem(const std::string& vstrFullPath) {
    const auto found = files_.Find(vstrFullPath);
    return found == nullptr ? nullptr : found->get();
}

std::vector<CHelpPrjFileCheckSum*> CHelpPrjCheckSums::ChangedFiles() const {
    std::vector<CHelpPrjFileCheckSum*> changed;
    for (const auto& file : files_)
        if (file->CheckSumChanged())
            changed.push_back(file.get());
    return changed;
}

ResultCode CHelpPrjCheckSums::Init(const std::string& vstrTvpFolder,
                                   const std::string& vstrCheckSumFileFolder,
                                   const std::string& vstrCheckSumFileName) {
    if (vstrTvpFolder.empty() || vstrCheckSumFileFolder.empty() || vstrCheckSumFileName.empty())
        return kFailure1;
    checkSumFile_ = platform::WithTrailingBackslash(vstrCheckSumFileFolder) + vstrCheckSumFileName + "CS.txt";
    folder_ = platform::WithTrailingBackslash(vstrTvpFolder);
    return Trapped(
        "CHelpPrjCheckSums", "Init", [&] { ReadFile(); },
        [&] {
            return "FullPath = " + checkSumFile_ + ", TVPFolder = " + vstrTvpFolder +
                   ", CheckSumFileFolder = " + vstrCheckSumFileFolder +
                   ", CheckSumFileName = " + vstrCheckSumFileName;
        });
}

void CHelpPrjCheckSums::ReadFile() {
    auto& files = *platform::Env().files;
    if (files.FileExists(checkSumFile_))
        ReadBytes(files.ReadFile(checkSumFile_));
    initialized_ = true;
}

void CHelpPrjCheckSums::ReadBytes(const std::string& bytes) {
    const auto lines = LinesOf(text::AnsiCodePage().Decode(bytes));
    for (std::size_t i = 1; i < lines.size(); ++i)
        ReadLine(lines[i]);
}

void CHelpPrjCheckSums::ReadLine(const std::string& line) {
    const auto fields = text::Split(line, "=");
    if (fields.size() != 2)
        return;
    auto record = std::make_unique<CHelpPrjFileCheckSum>();
    record->SetFolder(folder_);
    record->FileName = text::Trim(fields[0]);
    record->SavedCheckSum = text::Trim(fields[1]);
    record->CurrentCheckSum = record->SavedCheckSum;
    record->PreviousCheckSum = record->SavedCheckSum;
    const auto path = record->FullPath();
    if (!files_.Contains(path))
        files_.Add(std::move(record), path);
}

CHelpPrjFileCheckSum& CHelpPrjCheckSums::GetCheckSumObject(const std::string& vstrFullPath, bool vfRecalc) {
    if (const auto known = GetItem(vstrFullPath)) {
        if (vfRecalc)
            known->CurrentCheckSum = CalcTextFileCheckSum(vstrFullPath);
        return *known;
    }
    auto record = std::make_unique<CHelpPrjFileCheckSum>();
    record->CurrentCheckSum = CalcTextFileCheckSum(vstrFullPath);
    record->PreviousCheckSum = record->CurrentCheckSum;
    record->SetFolder(platform::FolderOf(vstrFullPath));
    record->FileName = platform::FileNameOf(vstrFullPath);
    auto& made = *record;
    files_.Add(std::move(record), vstrFullPath);
    return made;
}

ResultCode CHelpPrjCheckSums::Recalc(const std::vector<std::string>* rcol) {
    const auto names = rcol != nullptr ? *rcol : platform::Env().files->ListFiles(folder_, "*.htm");
    for (const auto& name : names) {
        LeaveIfInterrupted();
        GetCheckSumObject(folder_ + name, /*vfRecalc=*/true);
    }
    return kSuccess;
}

ResultCode CHelpPrjCheckSums::Save(bool vfSaveCurrentCheckSum) {
    if (!initialized_)
        return kFailure1;
    const bool readOnly = ExistsAndReadOnly(checkSumFile_);
    return Trapped(
        "CHelpPrjCheckSums", "Save",
        [&] {
            platform::Env().files->WriteFile(checkSumFile_,
                                             text::AnsiCodePage().Encode(FileText(vfSaveCurrentCheckSum)));
        },
        [&] { return checkSumFile_ + kCrLf + ReadOnlyDetail(readOnly); });
}

std::string CHelpPrjCheckSums::FileText(bool saveCurrent) {
    std::string out = "Version=1.0";
    out += kCrLf;
    for (const auto& file : files_) {
        if (file->CheckSumChanged() && (file->SavedCheckSum.empty() || saveCurrent))
            file->SavedCheckSum = file->CurrentCheckSum;
        out += file->FileName + '=' + file->SavedCheckSum + kCrLf;
    }
    return out;
}

void CHelpPrjCheckSums::Terminate() {
    if (terminated_)
        return;
    terminated_ = true;
    files_.Clear();
}

std::string CheckSumOfBytes(std::string_view bytes) {
    // A run looks at every page: sixteen bytes at a time, in sums of their own, go at the speed of memory.
    constexpr std::size_t kLanes = 16;
    const auto term = [](char byte, std::uint8_t place) {
        return static_cast<std::uint8_t>(static_cast<std::uint8_t>(byte) + place);
    };
    std::array<std::uint8_t, kLanes> lanes{};
    std::size_t i = 0;
    for (; i + kLanes <= bytes.size(); i += kLanes) {
        // Places wrap at a byte: counted in bytes they fit one register with the sums.
        const char* const at = bytes.data() + i;
        const auto place = static_cast<std::uint8_t>(i);
        for (std::uint8_t lane = 0; lane < kLanes; ++lane)
            lanes[lane] ^= term(at[lane], static_cast<std::uint8_t>(place + lane));
    }
    for (; i < bytes.size(); ++i)
        lanes[i % kLanes] ^= term(bytes[i], static_cast<std::uint8_t>(i));
    std::array<std::uint8_t, 4> sums{};
    for (std::size_t lane = 0; lane < kLanes; ++lane)
        sums[lane % sums.size()] ^= lanes[lane];
    constexpr const char* kDigits = "0123456789ABCDEF";
    std::string text;
    for (const auto sum : sums) {
        text += kDigits[sum >> 4U];
        text += kDigits[sum & 0x0FU];
    }
    return text;
}

std::string CalcTextFileCheckSum(const std::string& path) {
    auto& files = *platform::Env().files;
    // Nearly every page is there; to ask first would cost as much as opening it.
    try {
        return CheckSumOfBytes(files.ReadFile(path));
    } catch (const RaisedError&) {
        if (files.FileExists(path))
            throw;
        return {};
    }
}

} // namespace tovimar

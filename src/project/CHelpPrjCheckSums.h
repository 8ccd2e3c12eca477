#pragma once

#include "platform/Error.h"
#include "platform/KeyedList.h"

#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace tovimar {

/// The checksum of one topic page: 8 upper-case hexadecimal digits, empty for none.
class CHelpPrjFileCheckSum {
public:
    /// Name with extension.
    std::string FileName;
    /// As it stands in the checksum file; empty for a file that isn't listed yet.
    std::string SavedCheckSum;
    /// As last computed.
    std::string CurrentCheckSum;
    /// As computed when the record was made.
    std::string PreviousCheckSum;

    std::string FullPath() const;
    void SetFolder(const std::string& folder) { folder_ = folder; }
    bool CheckSumChanged() const;
    bool PreviousCheckSumChanged() const;

private:
    std::string folder_;
};

/// The checksums of a project's pages, kept in "<name>CS.txt" beside the project file, one line per page
/// behind the line "Version=1.0". They tell which pages were edited since the last generation.
class CHelpPrjCheckSums {
public:
    using FileList = KeyedList<std::unique_ptr<CHelpPrjFileCheckSum>>;

    /// Null for an absent path.
    CHelpPrjFileCheckSum* GetItem(const std::string& vstrFullPath);
    FileList& Files() { return files_; }
    std::vector<CHelpPrjFileCheckSum*> ChangedFiles() const;
    bool Initialized() const { return initialized_; }
    /// 0x80040001 for an empty folder or name. Right after it no page counts as changed.
    ResultCode Init(const std::string& vstrTvpFolder, const std::string& vstrCheckSumFileFolder,
                    const std::string& vstrCheckSumFileName);
    /// The records of a checksum file's bytes; lines that are none are passed over.
    void ReadBytes(const std::string& bytes);
    /// The checksum file as `Save` writes it.
    std::string FileText(bool vfSaveCurrentCheckSum);
    /// An edited page is accepted only with `vfSaveCurrentCheckSum`; a page new to the list always.
    ResultCode Save(bool vfSaveCurrentCheckSum = false);
    /// File names in the pages' folder; without a list all "*.htm" files.
    ResultCode Recalc(const std::vector<std::string>* rcol = nullptr);
    /// Makes the record of an absent path.
    CHelpPrjFileCheckSum& GetCheckSumObject(const std::string& vstrFullPath, bool vfRecalc);
    void Terminate();

private:
    void ReadFile();
    void ReadLine(const std::string& line);

    std::string checkSumFile_;
    std::string folder_;
    FileList files_;
    bool initialized_ = false;
    bool terminated_ = false;
};

/// Each byte plus its position (low 8 bits) goes by exclusive or into one of four accumulators in turn.
std::string CheckSumOfBytes(std::string_view bytes);
/// Empty for an absent file.
std::string CalcTextFileCheckSum(const std::string& path);

} // namespace tovimar

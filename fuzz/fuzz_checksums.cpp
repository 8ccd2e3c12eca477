// Checksum files lie beside the topics, where anybody edits them: what is read of one and written is read as
// the same again.

#include "QuietSurroundings.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjCheckSums.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    tovimar::fuzz::Prepare();
    const auto written = [](const std::string& bytes) {
        tovimar::CHelpPrjCheckSums sums;
        sums.ReadBytes(bytes);
        return tovimar::text::AnsiCodePage().Encode(sums.FileText(/*vfSaveCurrentCheckSum=*/true));
    };
    const auto first = written(std::string(tovimar::fuzz::Text(data, size)));
    if (written(first) != first)
        __builtin_trap();
    tovimar::CheckSumOfBytes(tovimar::fuzz::Text(data, size));
    return 0;
}

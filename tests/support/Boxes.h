#pragma once

#include "platform/access/Design.h"

#include <cstdint>
#include <string>
#include <vector>

/// Designs whose controls are painted as boxes in a colour of their own, so that a picture tells where each
/// of them lies.
namespace tovimar::test {

/// Colours by numbers from 1 on, far from those of frames, bars and grounds: as a design writes it, and as a
/// picture shows it (0x00RRGGBB).
std::int32_t BoxOleColor(int number);
std::uint32_t BoxColor(int number);
/// 0 for a colour that is none of a box.
int BoxNumber(std::uint32_t color);

/// What a box stands for.
struct Box {
    enum class Kind { Plain, Label, Group, Frame, Tab };
    Kind kind = Kind::Plain;
    int design = 0;        ///< the same for all boxes of a form
    int parent = 0;        ///< number of the control that it lies in, 0 for a section
    bool repeated = false; ///< stands in each record of a continuous form
    bool column = false;   ///< a form view shows it as a column
    bool headless = false; ///< a tab control that shows no tabs
};

/// Writes exports of boxes. The controls that hold others keep their kinds: option groups and tab controls
/// are painted as they are, a subform's frame in its colour. Every other kind that a topic tells of becomes a
/// text box, those that it doesn't tell of paint nothing. All are visible and named "c<number>x".
class BoxedExports {
public:
    /// Empty for a design without an object.
    std::string Write(const platform::access::Design& design);

    const Box& Of(int number) const { return boxes_.at(static_cast<std::size_t>(number)); }
    int Last() const { return static_cast<int>(boxes_.size()) - 1; }

private:
    void WriteRoot(const platform::access::DesignObject& root);
    void WriteChildren(const platform::access::DesignObject& parent, Box box);
    void WriteControl(const platform::access::DesignObject& control, Box box);
    void WriteOwn(const platform::access::DesignObject& object);
    void WriteNumbers(const platform::access::DesignObject& object, std::initializer_list<const char*> names);
    void Line(const std::string& name, const std::string& value);

    std::vector<Box> boxes_{{}};
    int designs_ = 0;
    std::string out_;
};

} // namespace tovimar::test

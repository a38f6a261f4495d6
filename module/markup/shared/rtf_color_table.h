#pragma once

#include <unordered_map>
#include <vector>

#include "tz/text/std_str.h"

// Indices of colours that a text takes from its layer or its block.
inline constexpr int kByLayerIndex = 256;
inline constexpr int kByBlockIndex = 0;

// The colours of a rich text document. A colour's number is its place in the table; colours are
// 0x00BBGGRR. ByLayer and ByBlock stand in the table as the colours that the owner set for them,
// and are known again by these.
//
//   CRichTextColorTable colors;
//   colors.AddColor(1, false);      // red, as number 0
//   colors.EmitColorTable();        // {\colortbl\red255\green0\blue0;}
class CRichTextColorTable {
public:
    CRichTextColorTable() = default;
    virtual ~CRichTextColorTable() = default;
    CRichTextColorTable(CRichTextColorTable const&) = delete;
    CRichTextColorTable& operator=(CRichTextColorTable const&) = delete;

    // The first place of a colour, or -1.
    [[nodiscard]] int FindColor(unsigned int rgb) const;
    // Adds a colour and returns its place. A colour that is already there is not added again unless
    // `bForce` is set: a document that is read may list a colour twice.
    int AddColor(unsigned int rgb, bool bForce);
    // The same with an index of the host's palette, 256 for ByLayer or 0 for ByBlock.
    int AddColor(int index, bool bForce);
    // The colour of an index; `byLayer` and `byBlock` are the colours of the two special ones.
    [[nodiscard]] static unsigned int GetRGB(int index, unsigned int byLayer, unsigned int byBlock);
    // The colour of a number, or the index of the palette nearest to it. False, with 0 in the
    // result, for a number that the table lacks.
    [[nodiscard]] bool GetColor(int number, unsigned int& rgb) const;
    [[nodiscard]] bool GetColor(int number, int* index) const;
    // 256 and 0 for the colours of ByLayer and ByBlock, in this order; else the nearest index.
    [[nodiscard]] int GetTzadIndex(unsigned int rgb) const;

    void SetByLayerColor(unsigned int rgb) { m_nByLayerColor = rgb; }
    [[nodiscard]] unsigned int GetByLayerColor() const { return m_nByLayerColor; }
    void SetByBlockColor(unsigned int rgb) { m_nByBlockColor = rgb; }
    [[nodiscard]] unsigned int GetByBlockColor() const { return m_nByBlockColor; }

    // The table as a group. It holds only the colours that were added, so number 0 is the first of
    // them.
    [[nodiscard]] CStdStrW EmitColorTable() const;

private:
    std::vector<unsigned int> m_aColors;
    unsigned int m_nByLayerColor = 0;
    unsigned int m_nByBlockColor = 0;
    std::unordered_map<unsigned int, int> firstPlaces_;
    mutable std::unordered_map<unsigned int, int> nearestIndices_;  // as far as asked for
};

// Host signatures of every routine, one alias per shape.  The host calls a
// patched slot with exactly the signature of the routine placed in it; the
// adapters, the routine sets and the reference host all use these aliases.
#pragma once

#include <cstdint>

using u8 = unsigned char;
using u16 = unsigned short;
using i16 = short;
using u32 = unsigned int;

// Parameter records owned by the host; their layouts live with their kernels.
struct Blend8Parameters;
struct SimpleFilterData;
struct BrushData;

namespace halideqk::sig {

using Blend8 = void(const Blend8Parameters *);
using PlanarOver = void(const u8 *, const u8 *, const u8 *, const u8 *, u8 *, u8 *, u8 *, u8 *,
                        int, int, int, int);
using PlanarAtop = void(const u8 *, const u8 *, const u8 *, const u8 *, u8 *, u8 *, u8 *, int,
                        int, int, int);
using PlanarOverStrength = void(const u8 *, const u8 *, const u8 *, const u8 *, u8 *, u8 *, u8 *,
                                u8 *, u8, int, int, int, int);
using PlanarAtopStrength = void(const u8 *, const u8 *, const u8 *, const u8 *, u8 *, u8 *, u8 *,
                                u8, int, int, int, int);
using Filter8 = void(const u8 *, u8 *, int, int, int, int, SimpleFilterData *);
using Filter16 = void(const u16 *, u16 *, int, int, int, int, SimpleFilterData *);
using FilterF = void(const float *, float *, int, int, int, int, SimpleFilterData *);
using SrcDstMask8 = void(const u8 *, u8 *, const u8 *, int, int, int, int, int);
using SrcDstMask16 = void(const u16 *, u16 *, const u16 *, int, int, int, int, int);
using SrcDstMaskF = void(const float *, float *, const float *, int, int, int, int, int);
using ConstDstMask8 = void(i16, u8 *, const u8 *, int, int, int, int);
using SrcDst8 = void(const u8 *, u8 *, int, int, int, int);
using SrcDst16 = void(const u16 *, u16 *, int, int, int, int);
using SrcDstF = void(const float *, float *, int, int, int, int);
using Color8 = void(const u8 *, const u8 *, const u8 *, u8 *, u8 *, u8 *, const u8 *, int, int,
                    int, int, int);
using Color16 = void(const u16 *, const u16 *, const u16 *, u16 *, u16 *, u16 *, const u16 *, int,
                     int, int, int, int);
using ColorF = void(const float *, const float *, const float *, float *, float *, float *,
                    const float *, int, int, int, int, int);
using ColorConst8 = void(i16, i16, i16, u8 *, u8 *, u8 *, const u8 *, int, int, int, int);
using ColorSolid8 = void(const u8 *, const u8 *, const u8 *, u8 *, u8 *, u8 *, int, int, int, int);
using TwoMasks8 = void(u8 *, u8 *, int, int, int, int);
using TwoMasks16 = void(u16 *, u16 *, int, int, int, int);
using BrushTip8 = void(int, int, int, int, int, int, u8 *, int, int, BrushData *);
using SrcDstValue8 = void(const u8 *, u8 *, int, int, int, int, u8);
using SrcDstValue16 = void(const u16 *, u16 *, int, int, int, int, u16);
using ScaleBrush = void(int, int, int, int, int, int, int, BrushData *);
using PencilTip16 = void(int, u16, int, int, int, int, u16 *, int, u16, BrushData *);
using AdjustOpacity = void(u8 *, int, int, int, i16);
using DodgeMidtones = void(u8 *, const u8 *, int, int, int, int);
using DissolveMask = void(u8 *, int, int, int, int, int);
using Overlap8 = void(const u8 *, const u8 *, u8 *, int, int, int, int, int);
using Overlap16 = void(const u16 *, const u16 *, u16 *, int, int, int, int, int);
using Combine8 = void(const u8 *, const u8 *, u8 *, int, int, int, int, int, u8, u8, u8);
using Combine16 = void(const u16 *, const u16 *, u16 *, int, int, int, int, int, u8, u8, u8);
using MergeNormal = void(const u8 *, u8 *, const u8 *, int, int, int, int, int, u8);
using RangeTable = const u8 (*)[256];
using BlendRange1 = void(const u8 *, u8 *, int, int, int, int, RangeTable, u32, i16);
using BlendRange3 = void(const u8 *, const u8 *, const u8 *, u8 *, int, int, int, int, RangeTable,
                         u32, i16);
using BlendRange4 = void(const u8 *, const u8 *, const u8 *, const u8 *, u8 *, int, int, int, int,
                         RangeTable, u32, i16);
using BlendRange1A = void(const u8 *, u8 *, const u8 *, int, int, int, int, int, RangeTable, u32,
                          i16);
using BlendRange3A = void(const u8 *, const u8 *, const u8 *, u8 *, const u8 *, int, int, int, int,
                          int, RangeTable, u32, i16);
using BlendRange4A = void(const u8 *, const u8 *, const u8 *, const u8 *, u8 *, const u8 *, int,
                          int, int, int, int, RangeTable, u32, i16);
using Revert = void(const u8 *, u8 *, u8 *, int, int, int, int, int);
using MinOrMax3_8 = void(const u8 *, const u8 *, const u8 *, u8 *, int, int, int, int, int, int,
                         SimpleFilterData *);
using MinOrMax3_16 = void(const u16 *, const u16 *, const u16 *, u16 *, int, int, int, int, int,
                          int, SimpleFilterData *);
using MinOrMax3F = void(const float *, const float *, const float *, float *, int, int, int, int,
                        int, int, SimpleFilterData *);
using HueSatTable = i16 (*)[1536];
using MapRGBHueSat2 = void(u8 *, u8 *, u8 *, const u8 *, HueSatTable, HueSatTable, const u8 *,
                           HueSatTable, int, int, int, int);
using ScaledGray16 = void(u16 *, int, int, int, int, int);
using RGB48toRGB24 = void(const u16 *, const u16 *, const u16 *, u8 *, u8 *, u8 *, int, int, int,
                          int, u8);
using Gray16toGray8 = void(const u16 *, u8 *, int, int, int, int, u8);
using Gray32toGray8 = void(const float *, u8 *, int, int, int, int, u8);
using Gray8toGray16 = void(const u8 *, u16 *, int, int, int, int);
using Interleave4to4 = void(const u8 *, const u8 *, const u8 *, const u8 *, u32 *, u32, u32, u32,
                            u32);
using SetBytes = void(u8 *, int, u8);
using SetShorts = void(u16 *, int, u16);
using Set32Bit = void(void *, int, u32);
using BlockMove = void(const u8 *, u8 *, int);
using SetRect = void(u8 *, int, int, int, u8);
using SetRectDeep = void(u16 *, int, int, int, u16);
using StepMove8 = void(const u8 *, u8 *, int, int, int, int, int, int);
using StepMove16 = void(const u16 *, u16 *, int, int, int, int, int, int);
using StepMoveF = void(const float *, float *, int, int, int, int, int, int);
using CrossBrush8 = void(int, int, int, int, int, int, u8 *, int, BrushData *);
using CrossBrush16 = void(int, int, int, int, int, int, u16 *, int, BrushData *);
using MaxCrossBrush16 = void(int, int, int, int, int, int, u16 *, int, int, BrushData *);
using CrossStamp8 = void(int, int, int, int, int, int, int, u8 *, int, BrushData *);
using CrossStamp16 = void(int, int, int, int, int, int, int, u16 *, int, BrushData *);
using SubtractTip = void(int, int, int, BrushData *);
using AirbrushTip8 = void(int, int, int, int, int, u8 *, int, int, int, BrushData *);
using AirbrushTip16 = void(int, int, int, int, int, u16 *, int, u16, u16, BrushData *);

}  // namespace halideqk::sig

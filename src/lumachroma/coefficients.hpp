// The named coefficient sets of the luma-chroma conversions. Each set is used exactly as listed by the
// forms that name it; no set can be derived from another by rounding, so near twins stay separate.
// Later families (sampled conversions, 16-bit RGB words) take their sets from here by name.
#pragma once

namespace zox {

// ---- YUV: full-range analogue weights ---------------------------------------------------------------

// Y in 1/65536 (unsigned gains on 256 x sample), U and V in 1/32768 (signed gains on 128 x sample).
struct YuvMatrixForward {
    static constexpr int yR = 19595, yG = 38469, yB = 7471;
    static constexpr int uR = -4816, uG = -9469, uB = 14286;
    static constexpr int vR = 20152, vG = -16875, vB = -3276;
};
// The three luma weights sum to 65536 (38470 for green); chroma gains act on B - Y and R - Y.
struct YuvDifferenceForward {
    static constexpr int yR = 19595, yG = 38470, yB = 7471;
    static constexpr int uGain = 32244, vGain = 57475;
};
// All in 1/32768; chroma gains act on 2B - 2Y and 2R - 2Y.
struct YuvHalfForward {
    static constexpr int yR = 9798, yG = 19235, yB = 3736;
    static constexpr int uGain = 16121, vGain = 28737;
};

// Gains of (U - 128) and (V - 128) for the inverse direction.
struct YuvInverseGains {
    int vR, uG, vG, uB;
};
inline constexpr YuvInverseGains YuvInverseRounded{74711, -25821, -38076, 133169};   // 1/65536
inline constexpr YuvInverseGains YuvInverseTruncated{74710, -25820, -38075, 133168}; // 1/65536
inline constexpr YuvInverseGains YuvInverseBlock8{9339, -3228, -4760, 16646};        // 1/8192
inline constexpr YuvInverseGains YuvInverseBlock16{9338, -3227, -4759, 16645};       // 1/8192
inline constexpr YuvInverseGains YuvInverseBlock128{4669, -1614, -2380, 8323};       // 1/4096
// The sampled members' wide block sets, on 128 x chroma in a multiply-high, the sum over 16: Y enters as
// 16 Y with no offset. The mixed set takes Cb to B from the 8-bit block set, the rest from the 16-bit one.
inline constexpr YuvInverseGains YuvInverseBlockMixed{9338, -3227, -4759, 16646};
inline constexpr YuvInverseGains Ycc709FullInverseBlock{12616, -1499, -3760, 14877};

// ---- YCbCr: studio range, Y 16..235, Cb and Cr 16..240 around 128 ------------------------------------

// Forward weights of R, G, B for Y, Cb and Cr, with their signs: the weighted sums are taken as they
// stand.
struct YccForwardGains {
    int yR, yG, yB;
    int cbR, cbG, cbB;
    int crR, crG, crB;
    bool full = false; // full-range luma: every sample held to 1..254
};
// Forward weights as magnitudes: the forms that use such a set put the minus signs themselves (Cb
// subtracts its R and G terms, Cr its G and B terms), because a rounded product of a negated gain is
// not the negated rounded product.
struct YccForwardMagnitudes {
    int yR, yG, yB;
    int cbR, cbG, cbB;
    int crR, crG, crB;
    bool full = false; // full-range luma: every sample held to 1..254
};
// BT.601 weights in 1/65536.
inline constexpr YccForwardGains YccForward{16843, 33030, 6423, -9699, -19071, 28770, 28770, -24117, -4653};
// The whole-sample sets of the sampled BT.709 members, in 1/65536: studio range, and full-range luma.
inline constexpr YccForwardGains YccPixel709{11993, 40239, 4063, -6619, -22151, 28770, 28770, -26149, -2621};
inline constexpr YccForwardGains YccPixel709Full{13959, 46858, 4719, -7668, -25821, 33489, 33489, -30409, -3080, true};
// The block sets of the sampled members: luma in 1/32768 on 256 x sample, chroma as magnitudes (Cb
// subtracts its R and G terms, Cr its G and B terms) on sums of a unit's samples.
inline constexpr YccForwardMagnitudes YccSum601{8422, 16515, 3212, 9699, 19071, 28770, 28770, 24117, 4653};
inline constexpr YccForwardMagnitudes YccSum709{5997, 20120, 2032, 6619, 22151, 28770, 28770, 26149, 2621};
inline constexpr YccForwardMagnitudes YccSum709Full{6980, 23429, 2359, 3834, 12911, 16744, 16744, 15204, 1540, true};
// BT.601 weights in 1/16384, for rounded multiplies of 128 x sample.
inline constexpr YccForwardMagnitudes YccForwardRound{4211, 8258, 1606, 2425, 4768, 7193, 7193, 6029, 1163};

// Inverse gains of y = Y - 16, u = Cb - 128 and v = Cr - 128.
struct YccInverseGains {
    int y, vR, uG, vG, uB;
    bool full = false; // full-range luma: the gain y acts on Y itself
};
// Whole-sample sets, in 1/65536.
inline constexpr YccInverseGains YccInversePixelA{76284, 104595, -25690, -53281, 132186};
inline constexpr YccInverseGains YccInversePixelB{76282, 104593, -25689, -53279, 132184};
inline constexpr YccInverseGains YccInversePixel709{76284, 117506, -13959, -34996, 138609};
inline constexpr YccInverseGains YccInversePixel709Full{65536, 100925, -11993, -30081, 119013, true};
// The 4:1:1 remainder set: near YccInversePixelA, with its own luma gain and Cb to green.
inline constexpr YccInverseGains YccInversePixel411{76294, 104595, -25625, -53281, 132186};
// Block sets, in 1/8192 overall: each gain multiplies 128 x value in a multiply-high, and the sum is
// divided by 16. A and B differ in the luma gain and in Cb to green.
inline constexpr YccInverseGains YccInverseBlockA{9536, 13074, -3203, -6660, 16523};
inline constexpr YccInverseGains YccInverseBlockB{9535, 13074, -3211, -6660, 16523};
// The BT.709 block set, scaled as the 601 block sets.
inline constexpr YccInverseGains Ycc709InverseBlock{9535, 14688, -1745, -4375, 17326};

// Folded and split sets of the sampled members, on 128 x sample in a multiply-high, the sum over 8. A
// folded set carries the offsets of Y, Cb and Cr in three constants (subtracted from the B, R and G
// terms), so that the raw samples go in; a split set takes y, u and v and has none.
struct YccFoldedGains {
    int y, cbB, crR, cbG, crG;
    int kB = 0, kR = 0, kG = 0;
};
inline constexpr YccFoldedGains YccFoldedA{4769, 8263, 6537, 1605, 3330, 2211, 1779, 1089};
inline constexpr YccFoldedGains YccFoldedB{4768, 8262, 6537, 1606, 3330, 2210, 1779, 1084};
inline constexpr YccFoldedGains YccFoldedC{4768, 8262, 6537, 1606, 3330, 2214, 1783, 1085};
inline constexpr YccFoldedGains YccSplitA{4767, 8261, 6537, 1605, 3330};
inline constexpr YccFoldedGains YccSplitB{4769, 8263, 6537, 1605, 3330};

} // namespace zox

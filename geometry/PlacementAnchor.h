// The placement anchor: which point of the imported points' bounding rectangle lands on the cursor.
//
// Anchors 1..8 run round the rectangle from the corner at minimum x and y (1) anticlockwise to the
// middle of the edge at minimum x (8); 0 and every other value is the centre. Both the insertion
// and its preview use these factors, in 32-bit floats, so the preview shows exactly the area
// filled.
#pragma once

struct CAnchorOffset {
    float fX;
    float fY;
};

// The share of the width and the height that lies left of and below the cursor for the anchor.
CAnchorOffset AnchorShares(int nAnchor);

// Where the rectangle's minimum corner goes when the anchor point lies at (fX, fY).
inline CAnchorOffset PlacementOrigin(int nAnchor, float fX, float fY, float fWidth, float fHeight) {
    const CAnchorOffset share = AnchorShares(nAnchor);
    return {fX - fWidth * share.fX, fY - fHeight * share.fY};
}

// The rectangle's corner with the smallest x and the largest y, for the same placement.
inline CAnchorOffset PlacementCorner(int nAnchor, float fX, float fY, float fWidth, float fHeight) {
    const CAnchorOffset share = AnchorShares(nAnchor);
    return {fX - fWidth * share.fX, fY + fHeight * (1.0f - share.fY)};
}

#include "geometry/PlacementAnchor.h"

CAnchorOffset AnchorShares(int nAnchor) {
    switch (nAnchor) {
        case 1:
            return {0.0f, 0.0f};  // corner at minimum x, minimum y
        case 2:
            return {0.5f, 0.0f};  // middle of the edge at minimum y
        case 3:
            return {1.0f, 0.0f};  // corner at maximum x, minimum y
        case 4:
            return {1.0f, 0.5f};  // middle of the edge at maximum x
        case 5:
            return {1.0f, 1.0f};  // corner at maximum x, maximum y
        case 6:
            return {0.5f, 1.0f};  // middle of the edge at maximum y
        case 7:
            return {0.0f, 1.0f};  // corner at minimum x, maximum y
        case 8:
            return {0.0f, 0.5f};  // middle of the edge at minimum x
        default:
            return {0.5f, 0.5f};  // centre
    }
}

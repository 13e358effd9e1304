// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <vector>

#include <olvane/charts/GapTracksInternal.h>
#include <olvane/charts/PlanInternal.h>
#include <olvane/picture/Picture.h>

namespace olvane::charts {

// Makes the picture of a plan whose households have their places and whose families have their tracks.
class PlanPicture {
public:
    PlanPicture(const kin::KinGraph& graph, const ChartRequest& request, const PlanSizes& sizes,
                const std::vector<bool>& shown, const Plan& plan, const GapTracks& gaps);

    picture::Picture make();

private:
    // A family with the places that its lines start from.
    struct Start {
        double dropX;
        double dropY;
        double barY;
    };

    void measureRows();
    void reserve();
    void addBoxes();
    void addFamilies();
    void addFamily(Index family);
    double addPartnersLine(const PlannedFamily& family, std::size_t row);
    double addOverLine(const PlannedFamily& family, std::size_t row, double middle);
    void addChildrenLines(Index family, const Start& start);
    void addMarks(Index family);
    void addLine(picture::LineRole role, double x1, double y1, double x2, double y2, Index child);
    void turn();

    double xOf(Index box) const {
        return plan_.households[at(plan_.householdOf[at(box)])].x - left_ + plan_.boxX[at(box)];
    }
    std::size_t rowOf(Index box) const {
        return at(plan_.households[at(plan_.householdOf[at(box)])].row - gaps_.firstRow());
    }

    const kin::KinGraph& graph_;
    const ChartRequest& request_;
    const PlanSizes& sizes_;
    const std::vector<bool>& shown_;  // by person
    const Plan& plan_;
    const GapTracks& gaps_;
    picture::Picture picture_;
    double left_ = 0;
    double width_ = 0;
    double height_ = 0;
    std::int32_t lastNumber_ = 0;
    std::vector<double> top_;     // by row
    std::vector<double> bottom_;  // by row
    std::vector<double> step_;    // by row: between tracks in the gap above it
};

}  // namespace olvane::charts

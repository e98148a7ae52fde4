/// @file
/// Arc length by GSL's adaptive quadrature.
#pragma once

#include "ZarnMath/Bezier/PowerForm.h"

#include <gsl/gsl_errno.h>
#include <gsl/gsl_integration.h>

#include <cmath>
#include <memory>

namespace ZarnMath::Peers {

/// The length of cubics, with a workspace that serves them all.
class GslLength
{
public:
    GslLength() : workspace(gsl_integration_workspace_alloc(limit), gsl_integration_workspace_free)
    {
        // It reports a tolerance that it cannot reach, as at a cusp, by ending the program otherwise.
        gsl_set_error_handler_off();
    }

    double operator()(const CubicBezier::PowerForm& form, double tolerance) const
    {
        gsl_function speed = {Speed, const_cast<CubicBezier::PowerForm*>(&form)};
        double length = 0.0;
        double error = 0.0;
        gsl_integration_qag(&speed, 0.0, 1.0, tolerance, 0.0, limit, GSL_INTEG_GAUSS15, workspace.get(), &length,
                            &error);
        return length;
    }

private:
    static constexpr std::size_t limit = 1000;

    static double Speed(double t, void* parameters)
    {
        const auto& form = *static_cast<const CubicBezier::PowerForm*>(parameters);
        return std::sqrt(LengthSquared(CubicBezier::Derivative(form.a, form.b, form.c, t)));
    }

    std::unique_ptr<gsl_integration_workspace, decltype(&gsl_integration_workspace_free)> workspace;
};

} // namespace ZarnMath::Peers

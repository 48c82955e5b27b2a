#include "csc_feature.h"

#include "FeatureFlags.h"

extern "C" bool csc_feature_get_bool(int id)
{
	return ct::feature::FeatureFlags::instance().isEnabled(id);
}

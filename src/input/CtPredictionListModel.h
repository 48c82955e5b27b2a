#ifndef _CT_PREDICTION_LIST_MODEL_H_
#define _CT_PREDICTION_LIST_MODEL_H_

#include <contacts.h>

#include <string>
#include <vector>

// Existing persons whose display name contains a typed name, offered under
// the name field of a new contact: at most kMaxPredictions of them, in the
// order the contacts service returns them, leaving out persons whose display
// contact lives on a SIM card. Loads on the calling (main) thread.
class CtPredictionListModel {
public:
	struct Prediction {
		std::string number; // the contact's default number, empty when none
		std::string name;   // the person's display name, empty when none
		int contactId = 0;  // the person's display contact
	};

	static constexpr int kMaxPredictions = 10;

	explicit CtPredictionListModel(const std::string& searchName);
	CtPredictionListModel(const CtPredictionListModel&) = delete;
	CtPredictionListModel& operator=(const CtPredictionListModel&) = delete;

	// Sets the searched text and loads again.
	void reload(const std::string& searchName);
	const std::string& getSearchName() const { return __searchName; }
	int getCount() const { return static_cast<int>(m_predictions.size()); }
	const std::vector<Prediction>& getPredictionList() const { return m_predictions; }
	// A new contact record the caller destroys; null when the contact is gone.
	static contacts_record_h getContactRecordByContactId(int contactId);

private:
	void __loadPredictionList();
	// Appends the persons of one page of matches; returns how many the page held.
	int __appendPage(contacts_query_h query, int offset, int limit);
	void __appendPerson(contacts_record_h person);
	static int __getAddressbookIdByContactId(int contactId);
	static std::string __getDefaultNumberByContactId(int contactId);

	std::string __searchName;
	std::vector<Prediction> m_predictions;
};

#endif

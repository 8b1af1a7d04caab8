#include "jni/entry_frame.h"

#include "gateway/core/log.h"
#include "jni/modified_utf8.h"

bool CEntryCall::Borrow(const jstring* strings, size_t count, jintArray status) {
  if (m_options.opening != nullptr) debuglog(m_options.opening);
  bool lent = true;
  for (; lent && m_nTexts < count; ++m_nTexts) {
    jstring string = strings[m_nTexts];
    const char* const text =
        string == nullptr ? nullptr : m_pEnv->GetStringUTFChars(string, nullptr);
    m_strings[m_nTexts] = string;
    m_texts[m_nTexts] = text;
    lent = text != nullptr || string == nullptr;
  }
  m_status = status;
  if (lent && status != nullptr) {
    m_pElements = m_pEnv->GetIntArrayElements(status, nullptr);
    lent = m_pElements != nullptr;
  }
  if (!lent) {
    for (size_t i = 0; i < m_nTexts; ++i) Release(i);
  }
  return lent;
}

void CEntryCall::FillSession(CGatewayPub& object, const HostSession& session) const {
  object.m_nMarket = session.market;
  object.m_nPlatform = session.platform;
  object.m_nSeqNo = session.seqNo;
  object.setSerialNumber(m_texts[0]);
  object.setLocalIP(m_texts[1]);
  if (m_options.loggedText < m_nTexts) debuglog(m_texts[kSessionTexts + m_options.loggedText]);
}

jstring CEntryCall::Finish(char* result) {
  if (result != nullptr) MendModifiedUtf8(result);
  LogStep();
  if (m_options.logsResult) debuglog(result);
  LogStep();
  for (size_t i = 0; i + m_options.keptTexts < m_nTexts; ++i) {
    Release(i);
    LogStep();
  }
  if (m_pElements != nullptr) m_pEnv->ReleaseIntArrayElements(m_status, m_pElements, 0);
  LogStep();
  return m_pEnv->NewStringUTF(result == nullptr ? "" : result);
}

void CEntryCall::Release(size_t i) {
  if (m_texts[i] != nullptr) m_pEnv->ReleaseStringUTFChars(m_strings[i], m_texts[i]);
}

void CEntryCall::WriteStep() {
  LogLine(WIRE("%s%d"), m_options.stepLabel, m_nStep++);
}

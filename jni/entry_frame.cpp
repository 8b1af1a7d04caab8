#include "jni/entry_frame.h"

#include "gateway/core/log.h"
#include "jni/modified_utf8.h"

bool CEntryCall::Borrow(jintArray status) {
  if (m_options.opening != nullptr) debuglog(m_options.opening);
  for (size_t i = 0; i < m_nTexts; ++i) {
    const char* text = nullptr;
    if (m_strings[i] != nullptr) {
      text = m_pEnv->GetStringUTFChars(m_strings[i], nullptr);
      if (text == nullptr) return GiveBack(i);
    }
    m_texts[i] = text;
  }
  m_status = status;
  if (status == nullptr) return true;
  m_pElements = m_pEnv->GetIntArrayElements(status, nullptr);
  if (m_pElements == nullptr) return GiveBack(m_nTexts);
  return true;
}

bool CEntryCall::GiveBack(size_t count) {
  for (size_t i = 0; i < count; ++i) Release(i);
  return false;
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
  const size_t released = m_nTexts - m_options.keptTexts;
  for (size_t i = 0; i < released; ++i) {
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

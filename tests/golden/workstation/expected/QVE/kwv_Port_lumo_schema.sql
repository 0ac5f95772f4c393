drop table KWX_Port;

create table KWX_Port (
   HWARE_SYS_ID varchar(64) NOT NULL,
   CFG_CHG_TYPE varchar(12) NOT NULL,
   CFG_CHG_TIME varchar(32) NOT NULL,
   Row_Index varchar(5) NOT NULL,
   Name varchar(16) );

alter table KWX_Port add primary key ( HWARE_SYS_ID, CFG_CHG_TYPE, Row_Index );

drop view KWX_VPort;

create view KWX_VPort
as
select
   COMPUTER_SYS.QVE_OBJECT_ID,
   COMPUTER_SYS.QVE_OBJECT_LABEL,
   KWX_Port.*
from
   COMPUTER_SYS, KWX_Port
where
   COMPUTER_SYS.HWARE_SYS_ID =
   KWX_Port.HWARE_SYS_ID;

insert into QUERY_VIEWS (VIEW_NAME) values ('KWX_VPort');

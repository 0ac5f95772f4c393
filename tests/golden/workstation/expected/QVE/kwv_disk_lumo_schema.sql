drop table KWX_Fixed_and_cz9;

create table KWX_Fixed_and_cz9 (
   HWARE_SYS_ID varchar(64) NOT NULL,
   CFG_CHG_TYPE varchar(12) NOT NULL,
   CFG_CHG_TIME varchar(32) NOT NULL,
   Row_Index varchar(5) NOT NULL,
   DEV varchar(64),
   DRV_Name varchar(30),
   siz varchar(20),
   Removable varchar(32),
   Name varchar(255),
   Capacity varchar(20),
   DEV varchar(255),
   Speed varchar(20) );

alter table KWX_Fixed_and_cz9 add primary key ( HWARE_SYS_ID, CFG_CHG_TYPE, Row_Index );

drop view KWX_VFixed_and_cz9;

create view KWX_VFixed_and_cz9
as
select
   COMPUTER_SYS.QVE_OBJECT_ID,
   COMPUTER_SYS.QVE_OBJECT_LABEL,
   KWX_Fixed_and_cz9.*
from
   COMPUTER_SYS, KWX_Fixed_and_cz9
where
   COMPUTER_SYS.HWARE_SYS_ID =
   KWX_Fixed_and_cz9.HWARE_SYS_ID;

insert into QUERY_VIEWS (VIEW_NAME) values ('KWX_VFixed_and_cz9');
